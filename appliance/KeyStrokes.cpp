#include "appliance/KeyStrokes.h"

#include <QEvent>
#include <QMap>
#include <QMetaEnum>

namespace KeyStrokes
{

namespace
{

using Key = SubCommonDefine::tagSoftKeyBoardKeyData;

std::vector<Key> pressAndRelease(int code, int modifiers, const QString& text)
{
    Key press;
    press.eventType = QEvent::KeyPress;
    press.key = code;
    press.modifiers = modifiers;
    press.text = text.toStdWString();
    Key release = press;
    release.eventType = QEvent::KeyRelease;
    return {press, release};
}

// Returns the text that a key produces without modifiers.
QString textOfKey(int code)
{
    static const QMap<int, QString> texts = {
        {Qt::Key_Return, "\r"},   {Qt::Key_Enter, "\r"},    {Qt::Key_Tab, "\t"},  {Qt::Key_Backspace, "\b"},
        {Qt::Key_Delete, "\x7f"}, {Qt::Key_Escape, "\x1b"}, {Qt::Key_Space, " "},
    };
    return texts.value(code);
}

} // namespace

std::vector<Key> ofName(const QString& name)
{
    QStringList parts = name.split('+');
    const QString last = parts.takeLast();
    if (last.isEmpty() || (parts.isEmpty() && last.size() == 1))
        return {};
    int modifiers = 0;
    for (const QString& part : parts)
        if (part == "Shift")
            modifiers |= Qt::ShiftModifier;
        else if (part == "Ctrl")
            modifiers |= Qt::ControlModifier;
        else if (part == "Alt")
            modifiers |= Qt::AltModifier;
        else
            return {};
    bool known = false;
    const int code =
        QMetaEnum::fromType<Qt::Key>().keyToValue(("Key_" + last).toLatin1().constData(), &known);
    if (!known)
        return {};
    return pressAndRelease(code, modifiers, modifiers == 0 ? textOfKey(code) : QString());
}

std::vector<Key> ofText(const QString& text)
{
    std::vector<Key> keys;
    for (const uint codePoint : text.toUcs4()) {
        const char32_t character = codePoint;
        const bool upper = QChar::isUpper(character);
        const int code = static_cast<int>(QChar::toUpper(character));
        for (const Key& key : pressAndRelease(code, upper ? static_cast<int>(Qt::ShiftModifier) : 0,
                                              QString::fromUcs4(&character, 1)))
            keys.push_back(key);
    }
    return keys;
}

} // namespace KeyStrokes
