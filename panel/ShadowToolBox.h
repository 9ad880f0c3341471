#pragma once

#include "panel/ToolBox.h"

// The drop shadow of the text object: off, or one of three directions.
class ShadowToolBox : public ToolBox
{
    Q_OBJECT
public:
    static constexpr int SHADOWLABEL_WIDTH = 90;
    static constexpr int WIDGET_HEIGHT = 48;
    static constexpr int OFFBUTTON_WIDTH = 50;
    static constexpr int RIGHTBUTTON_WIDTH = 49;
    static constexpr int CENTERBUTTON_WIDTH = 49;
    static constexpr int LEFTBUTTON_WIDTH = 50;
    static constexpr int SPACING_BETWEEN_SHADOWLABEL_AND_OFFBUTTON = 41;
    static constexpr int USELESS_VALUE = -1;
    static constexpr int SWITCHSEPARATOR_WIDTH = 3;

    explicit ShadowToolBox(QWidget* parent);

    // Sets 0 off, 1 right down, 2 centre down, 3 left down; USELESS_VALUE selects none. Shown once the box is
    // enabled.
    void setShadow(int style) { m_style = style; }
    int getShadow() const { return m_style; }

    void setWidgetEnabled() override;
    void resetInitializeStyle() override;
    void translateText() override;

Q_SIGNALS:
    void shadowChange(int style, int id);

private:
    void setNoneShadow();
    void setRightDownShadow();
    void setCenterDownShadow();
    void setLeftDownShadow();
    void changeShadow(int style);
    void setOffShadowStyle();
    void setRightShadowStyle();
    void setCenterShadowStyle();
    void setLeftShadowStyle();
    void setSelected(const KSPushbutton* selected);

    QLabel* m_label = nullptr;
    KSPushbutton* m_off = nullptr;
    KSPushbutton* m_right = nullptr;
    KSPushbutton* m_center = nullptr;
    KSPushbutton* m_left = nullptr;
    int m_style = 0;
};
