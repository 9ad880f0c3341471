#pragma once

#include <QLineF>
#include <QPointF>
#include <QTextDocument>
#include <QTextLine>
#include <vector>

class QTextBlock;

// Where the positions of a laid-out document stand, in item coordinates. Line heights are added up once per
// layout, so that asking for every position of a document stays linear in its blocks. GUI thread only.
class CaretGeometry
{
public:
    explicit CaretGeometry(const QTextDocument& document);

    // Call when the layout changed.
    void invalidate() { m_valid = false; }

    // The caret of a position: line from its top to its bottom, point at the top left of the handle below it,
    // number of the block. False for a position outside the document; the arguments stay then.
    bool caretPoint(QLineF& line, QPointF& point, int& block, int position);

    // Places of the carets of all positions of one block.
    struct Caret {
        double x = 0.0;
        double top = 0.0;
        double height = 0.0;
    };
    void caretsOfBlock(const QTextBlock& block, std::vector<Caret>& carets);

    // Height of the document above the block, its margin included.
    double heightAbove(int blockNumber);

private:
    void refresh();
    double bottomOf(const QTextBlock& block, const QTextLine& line) const;

    const QTextDocument& m_document;
    // Sum of the heights of the blocks before each block.
    std::vector<double> m_heightsAbove;
    double m_documentHeight = 0.0;
    bool m_valid = false;
};
