#pragma once

#include "panel/ToolBox.h"

// Switches bold on or off; also holds the label of the row that it shares with ItalicToolBox.
class BoldToolBox : public ToolBox
{
    Q_OBJECT
public:
    static constexpr int WIDGET_HEIGHT = 48;
    static constexpr int LABEL_WIDTH = 100;
    static constexpr int BUTTON_WIDTH = 61;
    static constexpr int LAYOUT_SPACING = 0;
    static constexpr int LAYOUT_MARGIN = 0;
    static constexpr int SPACING_BETWEEN_LABEL_AND_BOLDBTN = 12;
    static constexpr int SPACING_BETWEEN_BOLDBTN_AND_ITALICBTN = 10;
    static constexpr int FONT_SIZE = 12;

    explicit BoldToolBox(QWidget* parent);

    // Shows 0 off or 1 on; any other value counts as off.
    void setFontBold(int bold);
    int getFontBold() const { return m_bold; }

    void resetInitializeStyle() override;
    void translateText() override;

Q_SIGNALS:
    void boldChange(int value, int id);

private:
    void boldBtnClicked();

    QLabel* m_label = nullptr;
    KSPushbutton* m_button = nullptr;
    int m_bold = 0;
};
