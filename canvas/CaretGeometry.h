#pragma once

#include <QLineF>
#include <QPointF>
#include <QTextDocument>
#include <QTextLine>
#include <vector>

class QTextBlock;

// Computes where the positions of a laid-out document are, in item coordinates. Line heights are added up
// once per layout, so that a query for every position takes time linear in the number of blocks. GUI thread
// only.
class CaretGeometry
{
public:
    explicit CaretGeometry(const QTextDocument& document);

    // Call after the layout changed.
    void invalidate() { m_valid = false; }

    // Computes the caret of a position: line from its top to its bottom, point at the top left of the handle
    // below it, number of its block. Returns false, with the arguments unchanged, for a position outside the
    // document.
    bool caretPoint(QLineF& line, QPointF& point, int& block, int position);

    // The carets of all positions of one block.
    struct Caret {
        double x = 0.0;
        double top = 0.0;
        double height = 0.0;
    };
    void caretsOfBlock(const QTextBlock& block, std::vector<Caret>& carets);

    // Returns the height of the document above the block, including the top margin.
    double heightAbove(int blockNumber);

private:
    void refresh();
    double bottomOf(const QTextBlock& block, const QTextLine& line) const;

    const QTextDocument& m_document;
    // For each block the sum of the heights of the blocks before it.
    std::vector<double> m_heightsAbove;
    double m_documentHeight = 0.0;
    bool m_valid = false;
};
