#pragma once

#include "panel/SizeLadder.h"
#include "panel/ToolBox.h"

#include <QEvent>
#include <QList>
#include <QPointF>
#include <memory>

class KSCombobox;
class OneFinger;
class QTouchEvent;
class SizeBoxLineEdit;

// The font size: a box to choose from a list or to type in, and two buttons that step through the ladder. It
// keeps one size for each selected character, so that stepping keeps their differences.
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

    // One size a character; shown without a signal.
    void setFontSize(const QList<int>& sizes);
    QList<int> fontSizes() const { return m_sizes; }
    // The size that is shown, the smallest of a mixed selection.
    int getFontSize() const;

    // True drops a size that is being typed: the last valid one is shown again and the field is left.
    void clearFocusOfSizeBoxLineEdit(bool clear);
    // The validator's verdict on what is being typed.
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
    // Typing has ended, accepted or not.
    void signalSizeToolBoxEditDone();
    // What the box shows: a row of the list, or -1, and a size.
    void setComboxIndex(int index);
    void setCurrentSize(int size);
    // A valid size was typed and entered.
    void validEditingText();

private:
    // What the field does now.
    enum class State {
        Shown,   // it shows the size of what is selected
        Writing, // it is being written from code
        Touched, // it is typed into, since the touch that is still on it
        Valid,   // it is typed into, and holds a size
        Invalid  // it is typed into, and holds no size
    };

    void createBox();
    void fontSizeChanged(const QString& text);
    void fontSizeToNext();
    void fontSizeToPrevious();
    void step(int (*next)(int));
    void setAllSizes(int size);
    void updateButtons();
    void showText(const QString& text);

    // Typing.
    bool doLineEditEvent(QEvent* event);
    bool onTouchEvent(const QTouchEvent* event);
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
    std::unique_ptr<OneFinger> m_finger; // on the field
    QLabel* m_ptLabel = nullptr;
    KSPushbutton* m_previous = nullptr;
    KSPushbutton* m_next = nullptr;
    QList<int> m_sizes{DEFAULT_SIZE};
    State m_state = State::Shown;
    QString m_lastValidText;
};
