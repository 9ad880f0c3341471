#pragma once

#include <QSize>

class KSBaseItemWidget;

// A row of a scroll viewer whose widget is made when it comes into view or is asked for. GUI thread only.
class ScrollViewerRow
{
public:
    ScrollViewerRow() = default;
    virtual ~ScrollViewerRow() = default;
    ScrollViewerRow(const ScrollViewerRow&) = delete;
    ScrollViewerRow& operator=(const ScrollViewerRow&) = delete;

    // Size of the widget in pixels.
    virtual QSize size() const = 0;
    // Makes a widget of that size, which passes to the viewer. Must not change the list.
    virtual KSBaseItemWidget* makeWidget() = 0;
};
