#pragma once

#include <QString>
#include <string>

class TEdge;

// The lines that the property panel writes into the operation log. GUI thread only.
namespace TextToolsLog
{

// Nothing for an empty line.
void write(const std::wstring& line);

std::wstring family(const QString& family);
std::wstring size(int size);
std::wstring bold(int on);
std::wstring italic(int on);
std::wstring color(const QString& color);
// Empty while the slider is dragged: a drag is logged once, at its end. kind: one of EdgeToolBox.
std::wstring edge(int on, const TEdge& edge, int undoFlag, int kind);
std::wstring shadow();
std::wstring align();
std::wstring kerning();
// direction: a button of RangeOfMoveText.
std::wstring move(int range, int direction);

} // namespace TextToolsLog
