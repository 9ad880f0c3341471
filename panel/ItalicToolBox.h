#pragma once

#include "panel/ToolBox.h"

// Switches italic on or off; a button without a label.
class ItalicToolBox : public ToolBox
{
    Q_OBJECT
public:
    static constexpr int ITALICBUTTON_WIDTH = 61;
    static constexpr int ITALICBUTTON_HEIGHT = 48;
    static constexpr int LAYOUT_MARGIN = 0;
    static constexpr int FONT_SIZE = 12;

    explicit ItalicToolBox(QWidget* parent);

    // Shows 0 off or 1 on; any other value counts as off.
    void setFontItalic(int italic);
    int getFontItalic() const { return m_italic; }

    void resetInitializeStyle() override;

Q_SIGNALS:
    void italicChange(int value, int id);

private:
    void italicBtnClicked();

    KSPushbutton* m_button = nullptr;
    int m_italic = 0;
};
