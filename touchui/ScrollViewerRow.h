#pragma once

#include <QSize>

class KSBaseItemWidget;

// A row of a scroll viewer whose widget is created when it becomes visible or is requested. GUI thread only.
class ScrollViewerRow
{
public:
    ScrollViewerRow() = default;
    virtual ~ScrollViewerRow() = default;
    ScrollViewerRow(const ScrollViewerRow&) = delete;
    ScrollViewerRow& operator=(const ScrollViewerRow&) = delete;

    // Returns the size of the widget in pixels.
    virtual QSize size() const = 0;
    // Creates a widget of that size, which the viewer then owns. Must not change the list.
    virtual KSBaseItemWidget* makeWidget() = 0;
};
