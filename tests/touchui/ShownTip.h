#pragma once

#include <QApplication>
#include <QWidget>

// Returns the window of the tool tip; null while none is shown.
inline QWidget* shownTip()
{
    const QWidgetList windows = QApplication::topLevelWidgets();
    for (QWidget* window : windows)
        if (window->objectName() == QStringLiteral("KSToolTip") && window->isVisible())
            return window;
    return nullptr;
}
