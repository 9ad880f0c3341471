#pragma once

#include <QList>
#include <QPoint>
#include <QString>

class ColorPalette;
class QWidget;

// The colour palette of the property panel, with the property that it sets and the colours that Cancel
// restores. GUI thread only.
class PanelPalette
{
public:
    // The property that the palette sets.
    enum Owner { NO_OWNER = 0, TEXT_COLOR_OWNER = 1, EDGE_COLOR_OWNER = 2 };

    // Creates the palette as a child of the panel.
    explicit PanelPalette(QWidget* panel);

    ColorPalette* widget() const { return m_palette; }
    Owner owner() const { return m_owner; }

    // Shows the palette for the owner, at a fixed distance from the position of the window (global
    // coordinates). A palette that is open for the other property is cancelled first. Returns false when it
    // is already open for the owner; the saved colours stay then.
    bool open(Owner owner, const QString& color, QPoint window);
    // Sets the colours that Cancel restores, one per character.
    void setSavedColors(const QList<QString>& colors) { m_savedColors = colors; }
    const QList<QString>& savedColors() const { return m_savedColors; }
    // Clears owner and saved colours.
    void forget();

    void cancel();
    // Cancels the palette unless the current change comes from the palette itself: after any other change the
    // previewed colour would be kept.
    void cancelUnlessAnswering();

    // While an instance exists, changes count as coming from the palette.
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
