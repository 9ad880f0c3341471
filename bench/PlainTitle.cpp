#include "bench/PlainTitle.h"

#include "canvas/CharacterFormat.h"
#include "document/Archive.h"
#include "document/TText.h"
#include "document/TextStyle.h"

#include <QPainter>
#include <QTextCursor>
#include <QTextDocument>

namespace
{

constexpr double BIG_POSITION = 1.5; // from the 1280 canvas to the 1920 raster
constexpr QSize MIDDLE(960, 540);
constexpr QSize SMALL(240, 135);

} // namespace

PlainTitle::PlainTitle(const Archive& archive, double ratio)
{
    for (const TText* record : archive.text()) {
        Text text;
        text.position = QPointF(record->getXValue(), record->getYValue()) * BIG_POSITION * ratio;
        for (const TextStyle* style : record->textItems()) {
            Run run;
            run.format.setFont(CharacterFormat::font(*style, ratio));
            run.format.setForeground(CharacterFormat::color(style->getFontColor()));
            if (text.runs.empty() || text.runs.back().format != run.format)
                text.runs.push_back(run);
            text.runs.back().text += QString::fromStdString(style->getText());
        }
        m_texts.push_back(std::move(text));
    }
}

void PlainTitle::fill(QTextDocument& document, std::size_t text) const
{
    QTextCursor cursor(&document);
    cursor.beginEditBlock();
    cursor.select(QTextCursor::Document);
    cursor.removeSelectedText();
    for (const Run& run : m_texts[text].runs)
        cursor.insertText(run.text, run.format);
    cursor.endEditBlock();
}

QImage PlainTitle::draw(QSize size, const QImage& background) const
{
    QImage image(size, QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    QPainter painter(&image);
    painter.setRenderHint(QPainter::Antialiasing);
    if (!background.isNull())
        painter.drawImage(0, 0, background);
    for (std::size_t i = 0; i < m_texts.size(); ++i) {
        QTextDocument document;
        document.setUndoRedoEnabled(false);
        fill(document, i);
        painter.save();
        painter.translate(m_texts[i].position);
        document.drawContents(&painter);
        painter.restore();
    }
    return image;
}

QList<QImage> PlainTitle::reduced(const QImage& big)
{
    const QImage middle = big.scaled(MIDDLE, Qt::IgnoreAspectRatio, Qt::SmoothTransformation);
    const QImage small = middle.scaled(SMALL, Qt::IgnoreAspectRatio, Qt::SmoothTransformation);
    QImage black(SMALL, QImage::Format_RGB32);
    black.fill(Qt::black);
    QPainter(&black).drawImage(0, 0, small);
    return {middle, black, small};
}
