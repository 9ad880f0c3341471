#pragma once

#include "panel/ToolBox.h"

class ColorButton;

// Shows the colour of the text on a button that opens the palette.
class TextColorToolBox : public ToolBox
{
    Q_OBJECT
public:
    static constexpr int COLORBUTTON_WIDTH = 50;
    static constexpr int COLORBUTTON_HEIGHT = 48;
    static constexpr int COLORBOX_LAYOUT_SPACING = 0;
    static constexpr int COLORBOX_LAYOUT_MARGIN = 0;
    static const QString DEFAULT_COLORVALUE;

    explicit TextColorToolBox(QWidget* parent);

    // Shows the colour, "#rrggbb".
    void setColor(const QString& color);
    QString getColor() const { return m_color; }
    // Called with the answer of the palette: state 0 preview, 1 OK, 2 Cancel.
    void getColorValue(const QString& color, int state);
    QString getRgbaValue(const QString& color) const;

    void setWidgetEnabled() override;
    void setWidgetDisabled() override;
    void resetInitializeStyle() override;

Q_SIGNALS:
    void textColorChange(QString color, int id, int state);
    // Emitted when the button was tapped.
    void clicked();

private:
    ColorButton* m_button = nullptr;
    QString m_color;
};
