#pragma once

#include "messaging/services/SubCommonDefine.h"

#include <memory>

class QObject;
class QString;
class QWidget;

// A field that is filled with the soft keyboard: describes itself to the keyboard and receives the typed
// text. An object of this class is used for a single call, during which the widget must exist. GUI thread
// only.
class InputField
{
public:
    // Returns the field for a widget with the input focus: a line edit, the line edit of a combo box, or the
    // text that is being edited in a graphics view. Null for null and for other widgets.
    static std::unique_ptr<InputField> of(QWidget* widget);
    // Returns the object as a widget if it accepts text, else null.
    static QWidget* takerOfText(QObject* object);

    InputField() = default;
    virtual ~InputField() = default;
    InputField(const InputField&) = delete;
    InputField& operator=(const InputField&) = delete;

    virtual SubCommonDefine::tagSoftKeyBoardInitData describe() const = 0;
    // Returns true if text is inserted while it is typed and the keyboard stays open on Enter and on changes
    // of focus. Otherwise the text is entered with Enter, which closes the keyboard.
    virtual bool keepsKeyboard() const = 0;
    // Enters a complete text and logs it as the operator's input.
    virtual void enter(const QString& text) = 0;
    // Has the field's validator check a text that is still being typed, without changing the field; listeners
    // of the validator are notified. Returns false if the field has no validator.
    virtual bool judge(const QString& text) = 0;
    // Positions are character positions in the field's text and are clamped to it.
    virtual void select(const SubCommonDefine::tagSoftKeyBoardKeyTextSelectionPos& pos) = 0;
    // Returns the object that receives the key events of the service.
    virtual QObject* keyReceiver() = 0;
    // Returns the object that is notified when the keyboard was closed. May be null.
    virtual QObject* closeReceiver() = 0;
};
