#pragma once

class PairList;
class BenchEnvironment;

// Each function registers the pairs of one topic.
namespace Topics
{

void addClosing(PairList& list);
void addEditing(PairList& list);
void addFilter(PairList& list);
void addList(PairList& list, const BenchEnvironment& environment);
void addMessaging(PairList& list);
void addPanel(PairList& list);
void addPaste(PairList& list, const BenchEnvironment& environment);
void addPictures(PairList& list, const BenchEnvironment& environment);
void addRendering(PairList& list, const BenchEnvironment& environment);
void addRoad(PairList& list, const BenchEnvironment& environment);
void addStart(PairList& list);
void addStyles(PairList& list);
void addTyping(PairList& list);
void addTitleFiles(PairList& list, const BenchEnvironment& environment);

} // namespace Topics
