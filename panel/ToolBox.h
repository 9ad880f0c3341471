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

// What the boxes of the property panel share: labels, touch buttons with icons, separators between the
// buttons of a switch, and how all of them look enabled, disabled, pressed and selected. A box emits its
// change signal for the operator's taps only; what is set from code is shown in silence.
//
// Labels, buttons and separators are owned by the box. GUI thread only.
class ToolBox : public QWidget
{
    Q_OBJECT
public:
    // Labels that stand on the left of a row.
    static const QString LABEL_REST_STYLE;
    static const QString LABEL_DISABLED_STYLE;
    // What a button that shows a colour has beside the colour.
    static const QString COLORBUTTON_STYLE;
    static const QString SWITCHSEPARATOR_STYLE;
    static const QString SWITCHSEPARATOR_DISABLED_STYLE;
    static constexpr QSize ICON_SIZE{48, 48};
    // Ends of the names of an icon's other forms.
    static constexpr char SELECTED_SUFFIX[] = "_Selected";
    static constexpr char DISABLED_SUFFIX[] = "_Disabled";
    // Resource path of a picture of the panel.
    static QString iconPath(const char* name);
    // The picture string of a text panel's button that is round at the given ends.
    static QString buttonImages(bool roundLeft, bool roundRight);
    // Pressing and releasing the button swaps its picture.
    static void connectLooks(KSPushbutton* button);

    explicit ToolBox(QWidget* parent);

    // Enabled, the box shows the value that was set last.
    virtual void setWidgetEnabled();
    virtual void setWidgetDisabled();
    bool isBoxEnabled() const { return m_boxEnabled; }
    // The value and the looks of a new box, disabled.
    virtual void resetInitializeStyle();
    virtual void translateText() {}

Q_SIGNALS:
    // Emitted before the box acts: a size that is being typed is dropped first.
    void signalClearSizeBoxLineEditFocus(bool clear);

protected:
    // Which ends of a button are round: a whole button, or a piece of a switch.
    enum Piece { Whole, LeftPiece, MiddlePiece, RightPiece };

    // icon: path of the icon at rest; its other forms lie beside it. Empty for a button with a text.
    KSPushbutton* addButton(Piece piece, const QSize& size, const QString& icon = QString());
    // Styles are applied with the box's state.
    QLabel* addLabel(const QSize& size, const QString& restStyle = LABEL_REST_STYLE,
                     const QString& disabledStyle = LABEL_DISABLED_STYLE);
    QWidget* addSeparator(int width, int height);
    QHBoxLayout* addRow(int height);

    // Enabled and disabled look of one button, for boxes whose buttons differ.
    void setButtonEnabled(KSPushbutton* button, bool enabled);
    void setButtonSelected(KSPushbutton* button, bool selected);
    // The chosen piece of a switch: it looks selected and cannot be tapped again.
    void setButtonChosen(KSPushbutton* button);

private:
    struct Button {
        KSPushbutton* button;
        QString icon;
        QString shownIcon;
        QHash<QString, QIcon> icons; // by their paths
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
