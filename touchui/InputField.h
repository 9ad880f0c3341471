#pragma once

#include "messaging/services/SubCommonDefine.h"

#include <memory>

class QObject;
class QString;
class QWidget;

// What the soft keyboard fills: describes itself to the keyboard and takes what the operator has typed there.
// An object of this class lives for one call, and so long the widget must. GUI thread only.
class InputField
{
public:
    // The field that a widget with the input focus is or shows: a line edit, the line edit of a combo box or
    // the text that is edited in a graphics view. Null for null and for other widgets.
    static std::unique_ptr<InputField> of(QWidget* widget);
    // The object as a widget when it takes text, else null.
    static QWidget* takerOfText(QObject* object);

    InputField() = default;
    virtual ~InputField() = default;
    InputField(const InputField&) = delete;
    InputField& operator=(const InputField&) = delete;

    virtual SubCommonDefine::tagSoftKeyBoardInitData describe() const = 0;
    // True when text goes in while it is typed, and the keyboard stays through Enter and changes of focus.
    // Else the text comes with Enter, which ends the field.
    virtual bool keepsKeyboard() const = 0;
    // Takes a complete text, and logs it as the operator's.
    virtual void enter(const QString& text) = 0;
    // Lets the field's validator, and whoever listens to it, judge a text that is still being typed, without
    // a change of the field. False when the field has no validator to ask.
    virtual bool judge(const QString& text) = 0;
    // Positions count characters of the field's text and are kept within it.
    virtual void select(const SubCommonDefine::tagSoftKeyBoardKeyTextSelectionPos& pos) = 0;
    // Where keys of the service go.
    virtual QObject* keyReceiver() = 0;
    // What is told that the keyboard was closed under the field. May be null.
    virtual QObject* closeReceiver() = 0;
};
