#pragma once

#include <QHash>
#include <QIcon>
#include <QList>
#include <QSize>
#include <QString>
#include <QWidget>

class KSPushbutton;
class QHBoxLayout;
class QLabel;

// Base class of the boxes of the property panel: labels, touch buttons with icons, separators between the
// buttons of a switch, and their looks when enabled, disabled, pressed and selected. A box emits its change
// signal only for actions of the operator, not for values set from code.
//
// The box owns labels, buttons and separators. GUI thread only.
class ToolBox : public QWidget
{
    Q_OBJECT
public:
    // Styles of the labels on the left of a row.
    static const QString LABEL_REST_STYLE;
    static const QString LABEL_DISABLED_STYLE;
    // Declarations of a button that shows a colour, apart from the colour.
    static const QString COLORBUTTON_STYLE;
    static const QString SWITCHSEPARATOR_STYLE;
    static const QString SWITCHSEPARATOR_DISABLED_STYLE;
    static constexpr QSize ICON_SIZE{48, 48};
    // Suffixes of the file names of an icon's other states.
    static constexpr char SELECTED_SUFFIX[] = "_Selected";
    static constexpr char DISABLED_SUFFIX[] = "_Disabled";
    // Returns the resource path of a picture of the panel.
    static QString iconPath(const char* name);
    // Returns the picture string of a panel button that is round at the given ends.
    static QString buttonImages(bool roundLeft, bool roundRight);
    // Makes the button change its picture when it is pressed and released.
    static void connectLooks(KSPushbutton* button);

    explicit ToolBox(QWidget* parent);

    // Enables the box, which then shows the value that was set last.
    virtual void setWidgetEnabled();
    virtual void setWidgetDisabled();
    bool isBoxEnabled() const { return m_boxEnabled; }
    // Resets the box to its initial value and disables it.
    virtual void resetInitializeStyle();
    virtual void translateText() {}

Q_SIGNALS:
    // Emitted before the box acts, to discard a size that is being typed.
    void signalClearSizeBoxLineEditFocus(bool clear);

protected:
    // Position of a button in a switch, which decides which of its ends are round.
    enum Piece { Whole, LeftPiece, MiddlePiece, RightPiece };

    // Adds a button. icon: path of the icon at rest, next to the files for its other states; empty for a
    // button with a text.
    KSPushbutton* addButton(Piece piece, const QSize& size, const QString& icon = QString());
    // Adds a label; the box applies the style for its state.
    QLabel* addLabel(const QSize& size, const QString& restStyle = LABEL_REST_STYLE,
                     const QString& disabledStyle = LABEL_DISABLED_STYLE);
    QWidget* addSeparator(int width, int height);
    QHBoxLayout* addRow(int height);

    // Sets the enabled state and look of one button, for boxes whose buttons differ.
    void setButtonEnabled(KSPushbutton* button, bool enabled);
    void setButtonSelected(KSPushbutton* button, bool selected);
    // Marks the active button of a switch: it looks selected and cannot be tapped.
    void setButtonChosen(KSPushbutton* button);

private:
    struct Button {
        KSPushbutton* button;
        QString icon;
        QString shownIcon;
        QHash<QString, QIcon> icons; // by path
    };
    struct Styled {
        QWidget* widget;
        QString restStyle;
        QString disabledStyle;
    };

    void applyState(bool enabled);
    void showIcon(Button& button);
    static QIcon iconOf(Button& button, const QString& name);
    Button* find(const KSPushbutton* button);

    QList<Button> m_buttons;
    QList<Styled> m_styled;
    bool m_boxEnabled = true;
};
