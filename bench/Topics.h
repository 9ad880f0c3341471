// The pairs of each topic.
#pragma once

class PairList;
class BenchEnvironment;

namespace Topics
{

void addMessaging(PairList& list);
void addPictures(PairList& list, const BenchEnvironment& environment);
void addTitleFiles(PairList& list, const BenchEnvironment& environment);

} // namespace Topics
