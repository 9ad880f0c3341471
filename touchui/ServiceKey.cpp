#include "touchui/ServiceKey.h"

#include <QKeyEvent>

using SubCommonDefine::tagSoftKeyBoardKeyData;

std::optional<tagSoftKeyBoardKeyData> ServiceKey::ofPress(const QEvent* event)
{
    if (event->type() != QEvent::KeyPress)
        return std::nullopt;
    const auto* key = static_cast<const QKeyEvent*>(event);
    tagSoftKeyBoardKeyData data;
    data.eventType = key->type();
    data.key = key->key();
    data.modifiers = static_cast<int>(key->modifiers());
    data.text = key->text().toStdWString();
    data.autoRepeat = key->isAutoRepeat();
    data.nativeVirtualKey = static_cast<int>(key->nativeVirtualKey());
    return data;
}

bool ServiceKey::isKey(const tagSoftKeyBoardKeyData& data)
{
    return data.eventType == QEvent::KeyPress || data.eventType == QEvent::KeyRelease;
}

QKeyEvent ServiceKey::toEvent(const tagSoftKeyBoardKeyData& data)
{
    return QKeyEvent(static_cast<QEvent::Type>(data.eventType), data.key,
                     Qt::KeyboardModifiers::fromInt(data.modifiers), QString::fromStdWString(data.text),
                     false, 1);
}

bool ServiceKey::isSpecial(const QEvent* event)
{
    if (event->type() != QEvent::KeyPress && event->type() != QEvent::KeyRelease)
        return false;
    const int key = static_cast<const QKeyEvent*>(event)->key();
    switch (key) {
    case Qt::Key_Tab:
    case Qt::Key_Space:
    case Qt::Key_Home:
    case Qt::Key_End:
    case Qt::Key_PageUp:
    case Qt::Key_PageDown:
        return true;
    default:
        return key >= Qt::Key_F1 && key <= Qt::Key_F12;
    }
}
