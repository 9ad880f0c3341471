#pragma once

#include <QImage>
#include <QList>
#include <QPointF>
#include <QString>
#include <QTextCharFormat>
#include <cstddef>
#include <vector>

class Archive;
class QTextDocument;

// The texts of a title as Qt lays them out and draws them by itself, without outlines and shadows. Fonts and
// formats are prepared by the constructor.
class PlainTitle
{
public:
    // ratio: pixels per pixel of the 1920 raster.
    PlainTitle(const Archive& archive, double ratio);

    std::size_t count() const { return m_texts.size(); }
    // Returns the place of a text in pixels.
    QPointF position(std::size_t text) const { return m_texts[text].position; }
    // Replaces what is in the document by the text.
    void fill(QTextDocument& document, std::size_t text) const;

    // Lays all texts out and draws them over the background, or on a transparent picture of this size.
    QImage draw(QSize size, const QImage& background) const;

    // Returns the smaller pictures that a title has besides the picture for air: half size, small on black,
    // and small.
    static QList<QImage> reduced(const QImage& big);

private:
    // Characters with the same format.
    struct Run {
        QString text;
        QTextCharFormat format;
    };
    struct Text {
        QPointF position;
        std::vector<Run> runs;
    };

    std::vector<Text> m_texts;
};
