#pragma once

#include "panel/ToolBox.h"

// Changes the letter spacing in five levels.
class KerningToolBox : public ToolBox
{
    Q_OBJECT
public:
    // Index into the panel's table of percentages.
    enum Level { DOUBLESMALL = 0, SMALL = 1, NORMAL = 2, BIGGER = 3, DOUBLEBIGGER = 4 };

    static constexpr int ALIGNLABEL_WIDTH = 84;
    static constexpr int WIDGET_HEIGHT = 48;
    static constexpr int LARGERBUTTON_WIDTH = 50;
    static constexpr int SMALLERBUTTON_WIDTH = 50;
    static constexpr int LAYOUT_SPACING = 0;
    static constexpr int LAYOUT_MARGIN = 0;
    static constexpr int SPACING_BEWTEEN_ALIGNLABEL_AND_SMALLERBUTTON = 39;
    static constexpr int SPACING_BEWTEEN_LARGERBUTTON_AND_ALIGNBUTTON = 10;
    static constexpr int SWITCHSEPARATOR_WIDTH = 3;

    explicit KerningToolBox(QWidget* parent);

    // Sets the level, or -1 for a spacing that is not a level. Shown once the box is enabled.
    void setKerning(int level) { m_level = level; }
    int getKerning() const { return m_level; }

    void setWidgetEnabled() override;
    void resetInitializeStyle() override;
    void translateText() override;

Q_SIGNALS:
    void kerningChange(int index, int id);

private:
    void setFontSpaceSmaller();
    void setFontSpaceLarger();
    void changeLevel(int level);
    void matchToKerningIndex(int level);

    QLabel* m_label = nullptr;
    KSPushbutton* m_smaller = nullptr;
    KSPushbutton* m_larger = nullptr;
    int m_level = NORMAL;
};
