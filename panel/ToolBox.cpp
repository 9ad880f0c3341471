#include "panel/ToolBox.h"

#include "touchui/KSPushbutton.h"

#include <QHBoxLayout>
#include <QLabel>
#include <QPixmap>

#include <algorithm>

const QString ToolBox::LABEL_REST_STYLE = QStringLiteral("QLabel {color:rgb(220, 220, 220); font:24px;}");
const QString ToolBox::LABEL_DISABLED_STYLE = QStringLiteral("QLabel {color:rgb(40, 40, 40); font:24px;}");
const QString ToolBox::COLORBUTTON_STYLE =
    QStringLiteral("border:2px solid rgb(18, 18, 18); border-radius:4px;");
const QString ToolBox::SWITCHSEPARATOR_STYLE =
    QStringLiteral("border:0px; background-image:url(:/TextToolPanel_Buttons/Button_48_switch_separator)");
const QString ToolBox::SWITCHSEPARATOR_DISABLED_STYLE = QStringLiteral(
    "border:0px; background-image:url(:/TextToolPanel_Buttons/Button_48_Disabled_switch_separator)");

namespace
{

const char BUTTON_TEXT_STYLE[] = "color:rgb(220, 220, 220); font:20px;";

} // namespace

QString ToolBox::iconPath(const char* name)
{
    return QStringLiteral(":/TextToolPanel_Buttons/") + QLatin1String(name);
}

QString ToolBox::buttonImages(bool roundLeft, bool roundRight)
{
    static const char* const STATES[] = {
        "Button_48_Rest",         "Button_48_Pressed",         "Button_48_Disabled",
        "Button_48selected_Rest", "Button_48selected_Pressed", "Button_48selected_Disabled"};
    QStringList names{QStringLiteral("TextToolPanel_Buttons")};
    for (const char* state : STATES) {
        const QString name = QString::fromLatin1(state);
        names << (roundLeft ? name + QLatin1String("_Left") : QString());
        names << name + QLatin1String("_Center");
        names << (roundRight ? name + QLatin1String("_Right") : QString());
    }
    return names.join(QLatin1Char(':'));
}

ToolBox::ToolBox(QWidget* parent) : QWidget(parent)
{
    setFocusPolicy(Qt::NoFocus);
}

KSPushbutton* ToolBox::addButton(Piece piece, const QSize& size, const QString& icon)
{
    auto* button = new KSPushbutton(
        buttonImages(piece == Whole || piece == LeftPiece, piece == Whole || piece == RightPiece), this);
    button->setFixedSize(size);
    button->setFocusPolicy(Qt::NoFocus);
    button->setIconSize(ICON_SIZE);
    button->setObjectName(icon.section(QLatin1Char('/'), -1));
    if (icon.isEmpty())
        button->setStyleSheet(QString::fromLatin1(BUTTON_TEXT_STYLE));
    connectLooks(button);
    m_buttons.append({button, icon, QString(), {}});
    showIcon(m_buttons.last());
    return button;
}

// A press changes the picture of a button, but not its icon.
void ToolBox::connectLooks(KSPushbutton* button)
{
    connect(button, &QAbstractButton::pressed, button, [button] {
        button->changeButtonState(button->isSelected() ? KSPushbutton::ButtonSelectedPressed
                                                       : KSPushbutton::ButtonPressed);
    });
    connect(button, &QAbstractButton::released, button, [button] {
        if (button->isEnabled())
            button->changeButtonState(button->isSelected() ? KSPushbutton::ButtonSelectedRest
                                                           : KSPushbutton::ButtonRest);
    });
}

QLabel* ToolBox::addLabel(const QSize& size, const QString& restStyle, const QString& disabledStyle)
{
    auto* label = new QLabel(this);
    label->setFixedSize(size);
    label->setStyleSheet(restStyle);
    m_styled.append({label, restStyle, disabledStyle});
    return label;
}

QWidget* ToolBox::addSeparator(int width, int height)
{
    auto* separator = new QLabel(this);
    separator->setFixedSize(width, height);
    separator->setStyleSheet(SWITCHSEPARATOR_STYLE);
    m_styled.append({separator, SWITCHSEPARATOR_STYLE, SWITCHSEPARATOR_DISABLED_STYLE});
    return separator;
}

QHBoxLayout* ToolBox::addRow(int height)
{
    auto* row = new QHBoxLayout(this);
    row->setContentsMargins(0, 0, 0, 0);
    row->setSpacing(0);
    setFixedHeight(height);
    return row;
}

void ToolBox::setWidgetEnabled()
{
    applyState(true);
}

void ToolBox::setWidgetDisabled()
{
    applyState(false);
}

void ToolBox::resetInitializeStyle()
{
    setWidgetDisabled();
}

// Does nothing when the state stays, since setting style sheets is slow.
void ToolBox::applyState(bool enabled)
{
    if (m_boxEnabled == enabled)
        return;
    m_boxEnabled = enabled;
    for (const Styled& styled : std::as_const(m_styled))
        styled.widget->setStyleSheet(enabled ? styled.restStyle : styled.disabledStyle);
    for (Button& button : m_buttons) {
        button.button->setEnabled(enabled);
        if (!enabled)
            button.button->changeButtonState(button.button->isSelected()
                                                 ? KSPushbutton::ButtonSelectedDisabled
                                                 : KSPushbutton::ButtonDisabled);
        showIcon(button);
    }
}

ToolBox::Button* ToolBox::find(const KSPushbutton* button)
{
    const auto found = std::find_if(m_buttons.begin(), m_buttons.end(),
                                    [button](const Button& entry) { return entry.button == button; });
    return found == m_buttons.end() ? nullptr : &*found;
}

void ToolBox::setButtonEnabled(KSPushbutton* button, bool enabled)
{
    button->setEnabled(enabled);
    if (Button* entry = find(button))
        showIcon(*entry);
}

void ToolBox::setButtonSelected(KSPushbutton* button, bool selected)
{
    button->setSelected(selected);
    if (Button* entry = find(button))
        showIcon(*entry);
}

void ToolBox::setButtonChosen(KSPushbutton* button)
{
    button->setEnabled(false);
    button->changeButtonState(KSPushbutton::ButtonSelectedRest);
    if (Button* entry = find(button))
        showIcon(*entry);
}

// Reads and decodes each icon file once. From a name without suffix, an icon would read the database of MIME
// types.
QIcon ToolBox::iconOf(Button& entry, const QString& name)
{
    auto known = entry.icons.find(name);
    if (known == entry.icons.end())
        known = entry.icons.insert(name, QIcon(QPixmap(name)));
    return *known;
}

// Chooses the icon for the state of the button. The active button of a switch keeps its selected icon
// although it cannot be tapped.
void ToolBox::showIcon(Button& entry)
{
    if (entry.icon.isEmpty())
        return;
    const KSPushbutton::_enumButtonState state = entry.button->buttonState();
    QString name = entry.icon;
    if (state == KSPushbutton::ButtonDisabled || state == KSPushbutton::ButtonSelectedDisabled)
        name += QLatin1String(DISABLED_SUFFIX);
    else if (entry.button->isSelected())
        name += QLatin1String(SELECTED_SUFFIX);
    if (name == entry.shownIcon)
        return;
    entry.shownIcon = name;
    entry.button->setIcon(iconOf(entry, name));
}
