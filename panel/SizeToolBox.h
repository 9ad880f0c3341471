#pragma once

#include "panel/SizeLadder.h"
#include "panel/ToolBox.h"

#include <QEvent>
#include <QList>
#include <QPointF>
#include <memory>

class KSCombobox;
class OneFinger;
class SizeBoxLineEdit;

// Sets the font size: a box to choose from a list or to type in, and two buttons for the next and previous
// step. Keeps one size for each selected character, so that steps preserve their differences.
class SizeToolBox : public ToolBox
{
    Q_OBJECT
public:
    static constexpr int MAXSIZE = SizeLadder::MAXSIZE;
    static constexpr int MINSIZE = SizeLadder::MINSIZE;
    static constexpr int DEFAULT_SIZE = 64;
    static constexpr int MAX_COUNT = 29;
    static constexpr int COMBOBOX_MAXCOUNT = 13;
    static constexpr int SIZELABEL_WIDTH = 100;
    static constexpr int WIDGET_HEIGHT = 48;
    static constexpr int PTLABEL_WIDTH = 45;
    static constexpr int NEXTBTN_WIDTH = 73;
    static constexpr int PREVIOUSBTN_WIDTH = 73;
    static constexpr int COMBOBOX_WIDTH = 71;
    static constexpr int SPACING_BETWEEN_SIZELABEL_AND_COMBOBOX = 12;
    static constexpr int SPACING_BETWEEN_COMBOBOX_AND_PTLABEL = 9;
    static constexpr int SPACING_BETWEEN_PTLABEL_AND_NEXTBUTTON = 11;
    static constexpr int SWITCHSEPARATOR_WIDTH = 3;
    static const QString REGEXP_VALUE;

    explicit SizeToolBox(QWidget* parent);

    // Shows the sizes, one per character, without emitting sizeChange.
    void setFontSize(const QList<int>& sizes);
    QList<int> fontSizes() const { return m_sizes; }
    // Returns the size shown, the smallest one of a mixed selection.
    int getFontSize() const;

    // Discards, with true, a size that is being typed: shows the last valid one and leaves the field.
    void clearFocusOfSizeBoxLineEdit(bool clear);
    // Called with the result of the validator for the text being typed.
    void setValid(bool valid);
    bool isEditing() const { return m_state != State::Shown && m_state != State::Writing; }
    void hideComboxList();

    void setWidgetEnabled() override;
    void setWidgetDisabled() override;
    void resetInitializeStyle() override;
    void translateText() override;

    bool eventFilter(QObject* object, QEvent* event) override;

Q_SIGNALS:
    void sizeChange(QList<int> sizes, int id);
    void signalShowSizeComboxList(bool shown);
    // Emitted when typing has ended, whether the size was accepted or not.
    void signalSizeToolBoxEditDone();
    // Emitted with what the box shows: the row of the list (-1: not in the list) and the size.
    void setComboxIndex(int index);
    void setCurrentSize(int size);
    // Emitted when a valid size was entered.
    void validEditingText();

private:
    // State of the field.
    enum class State {
        Shown,   // shows the size of the selection
        Writing, // is being written by code
        Touched, // edited; the touch that began the edit is still down
        Valid,   // edited; contains a size
        Invalid  // edited; does not contain a size
    };

    void createBox();
    void fontSizeChanged(const QString& text);
    void fontSizeToNext();
    void fontSizeToPrevious();
    void step(int (*next)(int));
    void setAllSizes(int size);
    void updateButtons();
    void showText(const QString& text);

    // Typing
    bool doLineEditEvent(QEvent* event);
    void actOnLineEdit(QEvent::Type mouse);
    void sendMouseToLineEdit(QEvent::Type type, const QPointF& position);
    void letGoOfLineEdit();
    void setFocusForLineEdit();
    void enterPressed();
    void editSizeFinished();
    void editingLeft();
    void resetLastValidTextAndShowWarning();
    void showWarningMessage();
    void closeKeyboard() const;
    void leaveEditing();

    QLabel* m_label = nullptr;
    KSCombobox* m_box = nullptr;
    SizeBoxLineEdit* m_edit = nullptr;
    std::unique_ptr<OneFinger> m_finger; // on the text field
    QLabel* m_ptLabel = nullptr;
    KSPushbutton* m_previous = nullptr;
    KSPushbutton* m_next = nullptr;
    QList<int> m_sizes{DEFAULT_SIZE};
    State m_state = State::Shown;
    QString m_lastValidText;
};
