// titler_reference TITLE.xml OUT.png: draws the texts of a title file at 1920x1080 with nothing but Qt's own
// text layout, strokes and shadow, so that the titler's picture can be compared with one that it has no part
// in. A title with a background is refused.
//
// Ends 2 on wrong use or an unreadable title.

#include <QApplication>
#include <QDomDocument>
#include <QFile>
#include <QGraphicsDropShadowEffect>
#include <QGraphicsPixmapItem>
#include <QGraphicsScene>
#include <QImage>
#include <QPainter>
#include <QPainterPath>
#include <QTextLayout>
#include <QTextStream>
#include <algorithm>
#include <memory>
#include <vector>

namespace
{

constexpr int WRONG_USE = 2;
constexpr QSize RASTER(1920, 1080);
constexpr double FROM_CANVAS = 1.5;       // stored places count canvas pixels
constexpr double MARGIN = 40.5;           // around a text, 27 on the canvas
constexpr double SIDE_MARGIN_SHARE = 0.3; // of the tallest line, left and right of each line
constexpr double BASELINE_SHARE = 0.85;   // of a line's height
constexpr double LAST_LINE_LIFT = 3.0;
constexpr double WITHOUT_WRAPPING = 100000.0;
const QColor SHADOW_COLOR(0, 0, 0, 190);

struct Letter {
    QString text;
    QFont font;
    QColor color;
    bool edge = false;
    int edgeWidth = 0;
    QColor edgeColor;

    bool looksLike(const Letter& other) const
    {
        return font == other.font && color == other.color && edge == other.edge &&
               edgeWidth == other.edgeWidth && edgeColor == other.edgeColor;
    }
};

struct Line {
    std::vector<Letter> letters;
    std::unique_ptr<QTextLayout> layout;

    QTextLine text() const { return layout->lineAt(0); }
};

Letter readLetter(const QDomElement& item)
{
    Letter letter;
    letter.text = item.attribute("text");
    letter.font = QFont(item.attribute("font"));
    letter.font.setPixelSize(item.attribute("size").toInt());
    letter.font.setBold(item.attribute("bold") == "1");
    letter.font.setItalic(item.attribute("text-italic") == "1");
    letter.font.setLetterSpacing(QFont::PercentageSpacing, item.attribute("text-kerning").toInt());
    letter.color = QColor(item.attribute("color"));
    letter.edge = item.attribute("text-edge") == "1";
    letter.edgeWidth = item.attribute("edge-width").toInt();
    letter.edgeColor = QColor(item.attribute("edge-color"));
    return letter;
}

std::vector<Line> readLines(const QDomElement& content)
{
    std::vector<Line> lines(1);
    for (auto item = content.firstChildElement("text-item"); !item.isNull();
         item = item.nextSiblingElement("text-item")) {
        Letter letter = readLetter(item);
        if (letter.text == "\n")
            lines.emplace_back();
        else
            lines.back().letters.push_back(std::move(letter));
    }
    return lines;
}

// Letters that look the same are set as one piece, as in running text: pairs of them are kerned.
void layOut(Line& line)
{
    QString text;
    QList<QTextLayout::FormatRange> formats;
    const Letter* previous = nullptr;
    for (const Letter& letter : line.letters) {
        const bool goesOn = previous && previous->looksLike(letter);
        previous = &letter;
        if (goesOn) {
            formats.last().length += int(letter.text.size());
            text += letter.text;
            continue;
        }
        QTextLayout::FormatRange range;
        range.start = int(text.size());
        range.length = int(letter.text.size());
        range.format.setFont(letter.font);
        formats.append(range);
        text += letter.text;
    }
    line.layout = std::make_unique<QTextLayout>(text);
    line.layout->setFormats(formats);
    line.layout->beginLayout();
    QTextLine only = line.layout->createLine();
    only.setLeadingIncluded(true);
    only.setLineWidth(WITHOUT_WRAPPING);
    line.layout->endLayout();
}

QImage drawContent(const QDomElement& content)
{
    std::vector<Line> lines = readLines(content);
    double tallest = 0.0;
    double widest = 0.0;
    for (Line& line : lines) {
        layOut(line);
        tallest = std::max(tallest, line.text().height());
        widest = std::max(widest, line.text().naturalTextWidth());
    }
    const double left =
        FROM_CANVAS * content.attribute("position-X").toDouble() + MARGIN + SIDE_MARGIN_SHARE * tallest;
    const double top = FROM_CANVAS * content.attribute("position-Y").toDouble() + MARGIN;
    // -1 left, 0 centre, 1 right
    const double share = (content.attribute("text-align").toInt() + 1) / 2.0;

    QImage image(RASTER, QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    QPainter painter(&image);
    painter.setRenderHint(QPainter::Antialiasing);
    for (const bool edges : {true, false}) {
        double y = top;
        for (const Line& line : lines) {
            const bool last = &line == &lines.back();
            const double baseline = y - (last ? LAST_LINE_LIFT : 0.0) + BASELINE_SHARE * line.text().height();
            const double begin = left + share * (widest - line.text().naturalTextWidth());
            int column = 0;
            for (const Letter& letter : line.letters) {
                QPainterPath path;
                path.addText(begin + line.text().cursorToX(column), baseline, letter.font, letter.text);
                path.setFillRule(Qt::WindingFill);
                column += int(letter.text.size());
                if (!edges) {
                    painter.fillPath(path, letter.color);
                } else if (letter.edge) {
                    const QPen pen(letter.edgeColor, 2.0 * letter.edgeWidth, Qt::SolidLine, Qt::SquareCap,
                                   Qt::SvgMiterJoin);
                    painter.strokePath(path.simplified(), pen);
                }
            }
            y += line.text().height();
        }
    }
    return image;
}

void draw(QPainter& painter, const QDomElement& content)
{
    QGraphicsScene scene(QRect(QPoint(), RASTER));
    auto* texts = scene.addPixmap(QPixmap::fromImage(drawContent(content)));
    const QPointF offset(content.attribute("shadow-direction-x").toDouble(),
                         content.attribute("shadow-direction-y").toDouble());
    if (!offset.isNull()) {
        auto* shadow = new QGraphicsDropShadowEffect;
        shadow->setColor(SHADOW_COLOR);
        shadow->setOffset(offset);
        shadow->setBlurRadius(content.attribute("shadow-blur-radius").toDouble());
        texts->setGraphicsEffect(shadow);
    }
    scene.render(&painter, QRectF(QPointF(), RASTER), scene.sceneRect());
}

} // namespace

int main(int argc, char* argv[])
{
    const QApplication application(argc, argv);
    const QStringList arguments = QApplication::arguments().mid(1);
    QFile file(arguments.value(0));
    QDomDocument document;
    if (arguments.size() != 2 || !file.open(QIODevice::ReadOnly) || !document.setContent(&file) ||
        !document.documentElement().firstChildElement("meta-bg").attribute("resource-big").isEmpty()) {
        QTextStream(stderr) << "titler_reference: wrong use, or a title that cannot be drawn\n";
        return WRONG_USE;
    }
    QImage image(RASTER, QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    QPainter painter(&image);
    const QDomElement texts = document.documentElement().firstChildElement("meta-text");
    for (auto content = texts.firstChildElement("content"); !content.isNull();
         content = content.nextSiblingElement("content"))
        draw(painter, content);
    painter.end();
    return image.save(arguments.at(1)) ? 0 : 1;
}
