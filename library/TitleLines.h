#pragma once

#include <QColor>
#include <QFont>
#include <QMargins>
#include <QRect>
#include <QSize>
#include <QString>
#include <QStringList>
#include <QTextLayout>
#include <QWidget>
#include <array>
#include <cstddef>

class QPainter;

// The first lines of a title's texts, one below the other. Paints them itself: a label for each line, with a
// style sheet, costs more than all the rest of a row in the list. They are laid out when they are first
// painted or asked for. Widget coordinates. GUI thread only.
class TitleLines : public QWidget
{
    Q_OBJECT

public:
    static constexpr std::size_t COUNT = 4;

    // How the lines are laid out and painted; sizes in pixels.
    struct Form {
        QSize line;         // with the padding
        int top = 0;        // of the first line
        int padding = 0;    // on the left and right of a line
        int fontHeight = 0; // pixel size of the font
        QColor text;
        QColor background; // none if invalid
    };

    explicit TitleLines(const Form& form, QWidget* parent = nullptr);

    // Shows the texts in the font family. One text is broken between words into the lines, of several each
    // has a line of its own. What does not fit is elided.
    void setTexts(const QStringList& texts, const QString& family);
    void setLineWidth(int width);
    int lineWidth() const { return m_form.line.width(); }

    // Returns the lines as they are shown; an empty line has no text.
    QStringList lines() const;
    // Returns the rectangle of the line with its padding.
    QRect lineRect(int index) const;
    // Returns the rectangle that the text of the line may cover.
    QRect textRect(int index) const;
    const Form& form() const { return m_form; }
    const QFont& lineFont() const { return m_font; }

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    using Lines = std::array<QTextLayout, COUNT>;

    const Lines& laidOut() const;
    QStringList brokenIntoLines(const QString& text) const;
    QPointF linePosition(std::size_t index) const;

    Form m_form;
    QFont m_font;
    QStringList m_texts;
    mutable Lines m_lines; // with their glyphs, so that scrolling does not look these up
    mutable bool m_isLaidOut = true;
};
