#pragma once

#include "touchui/KSCommonStyle.h"

#include <QPixmap>

#include <array>

class QStyleOptionTab;

// Paints the tabs of a KSTabBar from pictures. The image string is "<folder>:<left>:<centre>:<right>:..."
// with three names for each look in the order of Look; a name stands for ":/<folder>/<name>". Looks that are
// missing in the string are painted like Rest.
class KSTabStyle : public KSCommonStyle
{
    Q_OBJECT
public:
    enum Look { Rest, Pressed, Disabled, Selected, LookCount };

    // An empty string selects the standard pictures.
    explicit KSTabStyle(const QString& images = QString());
    void setImages(const QString& images);

    // Sets the tab that a finger holds; -1 for none.
    void setPressedTab(int index) { m_pressedTab = index; }

    void drawControl(ControlElement element, const QStyleOption* option, QPainter* painter,
                     const QWidget* widget = nullptr) const override;
    void drawPrimitive(PrimitiveElement element, const QStyleOption* option, QPainter* painter,
                       const QWidget* widget = nullptr) const override;
    int pixelMetric(PixelMetric metric, const QStyleOption* option = nullptr,
                    const QWidget* widget = nullptr) const override;

private:
    void drawTabBarShape(const QStyleOptionTab& option, QPainter& painter, const QWidget* widget) const;
    void drawTabBarLabel(const QStyleOptionTab& option, QPainter& painter) const;
    void drawTabBarPixmap(const QStyleOptionTab& option, QPainter& painter, QRect& area) const;
    bool isPressed(const QStyleOptionTab& option, const QWidget* widget) const;

    std::array<std::array<QPixmap, 3>, LookCount> m_pictures;
    int m_pressedTab = -1;
};
