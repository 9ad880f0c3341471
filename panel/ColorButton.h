#pragma once

#include "touchui/KSPushbutton.h"

#include <QColor>
#include <QString>

// A touch button that shows a colour: it is painted from its style sheet, darker while it is pressed and
// faint while it is disabled.
class ColorButton : public KSPushbutton
{
    Q_OBJECT
public:
    explicit ColorButton(QWidget* parent);

    // Returns "rgba(<red>, <green>, <blue>, <alpha>)" for a style sheet; black for a text that is not a
    // colour.
    static QString getRgbaValue(const QString& color);

    // Sets "background-color" to the colour and adds the rest of the declarations.
    void setFace(const QString& color, const QString& declarations);

protected:
    void paintEvent(QPaintEvent* event) override;
};
