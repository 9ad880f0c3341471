#include "canvas/ReportingTextItem.h"

void ReportingTextItem::contentsEdited(TText& before, TText& after, TText& lastBefore, TText& lastAfter)
{
    Q_EMIT signalObjectContentsEdited(&before, &after, &lastBefore, &lastAfter);
}

void ReportingTextItem::styleShown(TText& style)
{
    Q_EMIT signalNotifyPropertyAreaObjectSelectionStyleChange(&style);
}

void ReportingTextItem::selectionModeChanged(bool shadowAndAlign, bool move)
{
    Q_EMIT signalNotifyTextPropertyAreaObjectSelectionMode(shadowAndAlign, move);
}

void ReportingTextItem::objectSelected()
{
    Q_EMIT signalNotifyIfExistSelectedObject(true);
}

void ReportingTextItem::familyReplaced(const QString& family)
{
    Q_EMIT signalShowMessageWhenUsingDefaultFont(family);
}
