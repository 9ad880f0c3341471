#pragma once

#include <QString>
#include <string>

class TEdge;

// Writes the entries of the property panel in the operation log. GUI thread only.
namespace TextToolsLog
{

// Writes the line; an empty one is skipped.
void write(const std::wstring& line);

std::wstring family(const QString& family);
std::wstring size(int size);
std::wstring bold(int on);
std::wstring italic(int on);
std::wstring color(const QString& color);
// Returns an empty line while the slider is dragged: a drag is logged once, at its end. kind: one of
// EdgeToolBox.
std::wstring edge(int on, const TEdge& edge, int undoFlag, int kind);
std::wstring shadow();
std::wstring align();
std::wstring kerning();
// direction: one of the buttons of RangeOfMoveText.
std::wstring move(int range, int direction);

} // namespace TextToolsLog
