#pragma once

#include "panel/ToolBox.h"

// Left, centre and right alignment of the text object.
class AlignToolBox : public ToolBox
{
    Q_OBJECT
public:
    static constexpr int BUTTON_HEIGHT = 48;
    static constexpr int LEFTBUTTON_WIDTH = 48;
    static constexpr int RIGHTBUTTON_WIDTH = 48;
    static constexpr int CENTERBUTTON_WIDTH = 46;
    static constexpr int LAYOUT_SPACING = 0;
    static constexpr int LAYOUT_MARGIN = 0;
    static constexpr int SWITCHSEPARATOR_WIDTH = 3;
    static const QString ALIGNLEFT_ICON_PATH;
    static const QString ALIGNCENTER_ICON_PATH;
    static const QString ALIGNRIGHT_ICON_PATH;
    static const QString ALIGNLEFT_ICON_SELECTED_PATH;
    static const QString ALIGNCENTER_ICON_SELECTED_PATH;
    static const QString ALIGNRIGHT_ICON_SELECTED_PATH;
    static const QString ALIGNLEFT_ICON_DISABLED_PATH;
    static const QString ALIGNCENTER_ICON_DISABLED_PATH;
    static const QString ALIGNRIGHT_ICON_DISABLED_PATH;

    explicit AlignToolBox(QWidget* parent);

    // Sets -1 left, 0 centre or 1 right; any other value selects none. Shown once the box is enabled.
    void setAlign(int align) { m_align = align; }
    int getAlign() const { return m_align; }

    void setWidgetEnabled() override;
    void resetInitializeStyle() override;

Q_SIGNALS:
    void alignChange(int value, int id);

private:
    void leftBtnClicked();
    void centerBtnClicked();
    void rightBtnClicked();
    void changeAlign(int align);
    void setLeftButtonSelected();
    void setCenterButtonSelected();
    void setRightButtonSelected();
    void setSelected(const KSPushbutton* selected);

    KSPushbutton* m_left = nullptr;
    KSPushbutton* m_center = nullptr;
    KSPushbutton* m_right = nullptr;
    int m_align = -1;
};
