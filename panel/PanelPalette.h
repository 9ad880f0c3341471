#pragma once

#include <QList>
#include <QPoint>
#include <QString>

class ColorPalette;
class QWidget;

// The colour palette of the property panel: whose colour it chooses, and the colours that Cancel gives back.
// GUI thread only.
class PanelPalette
{
public:
    // Whose colour the palette chooses.
    enum Owner { NO_OWNER = 0, TEXT_COLOR_OWNER = 1, EDGE_COLOR_OWNER = 2 };

    // The panel owns the palette itself.
    explicit PanelPalette(QWidget* panel);

    ColorPalette* widget() const { return m_palette; }
    Owner owner() const { return m_owner; }

    // Shows the palette for the owner, at the place of the window (global) and a fixed distance. A palette
    // that is open for the other colour is cancelled by that first. Returns false when it is open for the
    // owner already: then it keeps what Cancel gives back.
    bool open(Owner owner, const QString& color, QPoint window);
    // What Cancel gives back, one colour a character.
    void setSavedColors(const QList<QString>& colors) { m_savedColors = colors; }
    const QList<QString>& savedColors() const { return m_savedColors; }
    // Forgets owner and colours.
    void forget();

    void cancel();
    // Cancels the palette unless it makes the current change itself: any other change would keep the
    // previewed colour.
    void cancelUnlessAnswering();

    // While one lives, changes are those of the palette.
    class Answer
    {
    public:
        explicit Answer(PanelPalette& palette);
        ~Answer();
        Answer(const Answer&) = delete;
        Answer& operator=(const Answer&) = delete;

    private:
        PanelPalette& m_palette;
        bool m_before;
    };

private:
    ColorPalette* m_palette;
    Owner m_owner = NO_OWNER;
    bool m_answers = false;
    QList<QString> m_savedColors;
};
