#pragma once

#include "panel/ToolBox.h"

class KSRadiobutton;

// Moves the text object by one step per tap: four direction buttons in a cross, and a choice of two
// distances.
class RangeOfMoveText : public ToolBox
{
    Q_OBJECT
public:
    static constexpr int MOVEBUTTON_WIDTH = 80;
    static constexpr int WIDGET_HEIGHT = 48;
    static constexpr int MOVEBOX_LAYOUT_SPACING = 0;
    static constexpr int MOVEBOX_LAYOUT_MARGIN = 0;
    static constexpr int DESCRIPTIONLABEL_WIDTH = 210;
    static constexpr int RADIOBUTTON_WIDTH = 36;
    static constexpr int RADIOBUTTON_HEIGHT = 36;
    static constexpr int SPACING_BETWEEN_LEFTBUTTON_AND_UPBUTTON = 21;
    static constexpr int SPACING_BETWEEN_UPBUTTON_AND_RIGHTBUTTON = 20;
    static constexpr int SPACING_BETWEEN_UPBUTTON_AND_DOWNBUTTON = 24;
    static constexpr int UPBUTTON_INDEX = 0;
    static constexpr int RIGHTBUTTON_INDEX = 1;
    static constexpr int DOWNBUTTON_INDEX = 2;
    static constexpr int LEFTBUTTON_INDEX = 3;
    static const QString MOVEDIRECTION_UP_ICON_PATH;
    static const QString MOVEDIRECTION_RIGHT_ICON_PATH;
    static const QString MOVEDIRECTION_DOWN_ICON_PATH;
    static const QString MOVEDIRECTION_LEFT_ICON_PATH;
    static const QString MOVEDIRECTION_UP_ICON_DISABLED_PATH;
    static const QString MOVEDIRECTION_RIGHT_ICON_DISABLED_PATH;
    static const QString MOVEDIRECTION_DOWN_ICON_DISABLED_PATH;
    static const QString MOVEDIRECTION_LEFT_ICON_DISABLED_PATH;
    static const QString MOVELABEL_STYLE;
    static const QString MOVELABEL_DISABLED_STYLE;

    explicit RangeOfMoveText(QWidget* parent);

    // Returns the distance of a step in pixels of the canvas, 2 or 10.
    int range() const { return m_range; }

    void setWidgetEnabled() override;
    void setWidgetDisabled() override;
    void resetInitializeStyle() override;
    void translateText() override;

    bool eventFilter(QObject* watched, QEvent* event) override;

Q_SIGNALS:
    // Emitted when a direction was tapped. direction: one of the button indices.
    void moveRangeChanged(int range, int direction, int id);

private:
    struct RangeChoice {
        KSRadiobutton* button = nullptr;
        QLabel* label = nullptr;
    };

    RangeChoice addRangeChoice(int id);
    void createLayout();
    QLayout* createCross();
    void moveChanged(int buttonId);
    void rangeReleased(int buttonId);
    void balanceDescription();

    QLabel* m_description = nullptr;
    RangeChoice m_twoPixels;
    RangeChoice m_tenPixels;
    KSPushbutton* m_buttons[4] = {};
    int m_range = 2;
};
