#include "panel/SizeToolBox.h"

#include "canvas/MessageBoxController.h"
#include "canvas/TextObjectConstants.h"
#include "panel/ComboxLineEditRegExpValidator.h"
#include "panel/SizeBoxLineEdit.h"
#include "panel/SizeCombox.h"
#include "touchui/KSInputContext.h"
#include "touchui/KSPushbutton.h"
#include "touchui/OneFinger.h"

#include <QCoreApplication>
#include <QGuiApplication>
#include <QHBoxLayout>
#include <QKeyEvent>
#include <QLabel>
#include <QRegularExpression>

#include <utility>

const QString SizeToolBox::REGEXP_VALUE = QStringLiteral("(^[2-9][0-9]{1}$)|(^[1-9][0-9][0-9]$)");

namespace
{

const char BOX_STYLE[] = "QComboBox {border:0;} QComboBox::drop-down {width:24px;}";
const char BOX_IMAGES[] = ":/TextToolPanel_TextBox/TextBox_Edittable";
const char PT_STYLE[] = "QLabel {color:rgb(220, 220, 220); font:20px;}";
const char PT_DISABLED_STYLE[] = "QLabel {color:rgb(40, 40, 40); font:20px;}";
constexpr int TEXT_ENABLED = 1;
constexpr int TEXT_DISABLED = 0;
// Parts of the name with which the field describes itself to the soft keyboard: kind, title, and "2" to
// select the whole text.
constexpr int KEYBOARD_KIND = 1;
const char SELECT_ALL[] = "2";

} // namespace

SizeToolBox::SizeToolBox(QWidget* parent) : ToolBox(parent)
{
    m_label = addLabel(QSize(SIZELABEL_WIDTH, WIDGET_HEIGHT));
    createBox();
    m_ptLabel = addLabel(QSize(PTLABEL_WIDTH, WIDGET_HEIGHT), QString::fromLatin1(PT_STYLE),
                         QString::fromLatin1(PT_DISABLED_STYLE));
    m_previous = addButton(LeftPiece, QSize(PREVIOUSBTN_WIDTH, WIDGET_HEIGHT), iconPath("Icon_SizeDown"));
    m_next = addButton(RightPiece, QSize(NEXTBTN_WIDTH, WIDGET_HEIGHT), iconPath("Icon_SizeUp"));

    QHBoxLayout* row = addRow(WIDGET_HEIGHT);
    row->addWidget(m_label);
    row->addSpacing(SPACING_BETWEEN_SIZELABEL_AND_COMBOBOX);
    row->addWidget(m_box);
    row->addSpacing(SPACING_BETWEEN_COMBOBOX_AND_PTLABEL);
    row->addWidget(m_ptLabel);
    row->addSpacing(SPACING_BETWEEN_PTLABEL_AND_NEXTBUTTON);
    row->addWidget(m_previous);
    row->addWidget(addSeparator(SWITCHSEPARATOR_WIDTH, WIDGET_HEIGHT));
    row->addWidget(m_next);

    connect(m_previous, &QAbstractButton::clicked, this, &SizeToolBox::fontSizeToPrevious);
    connect(m_next, &QAbstractButton::clicked, this, &SizeToolBox::fontSizeToNext);
    translateText();
    setFontSize(m_sizes);
}

void SizeToolBox::createBox()
{
    m_box = new SizeCombox(this);
    m_box->setObjectName(QStringLiteral("SizeBox"));
    m_box->setFixedSize(COMBOBOX_WIDTH, WIDGET_HEIGHT);
    m_box->setBackgroundImagesPath(QString::fromLatin1(BOX_IMAGES));
    m_box->setMaxVisibleItems(COMBOBOX_MAXCOUNT);
    for (const int size : SizeLadder::comboBoxSizes())
        m_box->addItem(QString::number(size));

    m_edit = new SizeBoxLineEdit(m_box);
    m_box->setLineEdit(m_edit);
    m_box->setStyleSheet(QString::fromLatin1(BOX_STYLE));
    m_box->setInsertPolicy(QComboBox::NoInsert);
    m_box->setCompleter(nullptr);
    auto* validator = new ComboxLineEditRegExpValidator(QRegularExpression(REGEXP_VALUE), m_edit);
    m_edit->setValidator(validator);
    m_edit->setReadOnly(true);
    m_edit->installEventFilter(this);
    m_finger = std::make_unique<OneFinger>(m_edit);
    connect(m_finger.get(), &OneFinger::acted, this, &SizeToolBox::actOnLineEdit);
    connect(m_finger.get(), &OneFinger::cancelled, this, &SizeToolBox::letGoOfLineEdit);
    m_box->installEventFilter(this);

    connect(validator, &ComboxLineEditRegExpValidator::validText, this, &SizeToolBox::setValid);
    connect(m_box, &QComboBox::currentIndexChanged, this,
            [this](int index) { fontSizeChanged(m_box->itemText(index)); });
    connect(m_box, &KSCombobox::signalPopupShow, this, [this] { clearFocusOfSizeBoxLineEdit(true); });
    connect(m_box, &KSCombobox::signalShowComboxList, this, &SizeToolBox::signalShowSizeComboxList);
    connect(this, &SizeToolBox::setComboxIndex, m_box, &QComboBox::setCurrentIndex);
    connect(this, &SizeToolBox::validEditingText, this, &SizeToolBox::editSizeFinished);
}

int SizeToolBox::getFontSize() const
{
    return SizeLadder::getMinSize(m_sizes);
}

void SizeToolBox::hideComboxList()
{
    m_box->hidePopup();
}

// Showing

void SizeToolBox::setFontSize(const QList<int>& sizes)
{
    if (sizes.isEmpty())
        return;
    const bool wasEditing = isEditing();
    m_state = State::Shown;
    m_sizes = sizes;
    showText(SizeLadder::displayText(sizes));
    updateButtons();
    if (wasEditing)
        leaveEditing();
    Q_EMIT setCurrentSize(getFontSize());
}

void SizeToolBox::showText(const QString& text)
{
    const State before = std::exchange(m_state, State::Writing);
    Q_EMIT setComboxIndex(m_box->findData(text, Qt::DisplayRole));
    if (m_edit->text() != text)
        m_box->setEditText(text);
    m_state = before == State::Invalid ? State::Valid : before;
}

void SizeToolBox::updateButtons()
{
    setButtonEnabled(m_previous, isBoxEnabled() && !SizeLadder::allIsMin(m_sizes));
    setButtonEnabled(m_next, isBoxEnabled() && !SizeLadder::allIsMax(m_sizes));
}

void SizeToolBox::setWidgetEnabled()
{
    ToolBox::setWidgetEnabled();
    m_box->setEnabled(true);
    m_edit->setState(TEXT_ENABLED);
    updateButtons();
}

void SizeToolBox::setWidgetDisabled()
{
    clearFocusOfSizeBoxLineEdit(true);
    ToolBox::setWidgetDisabled();
    m_box->setEnabled(false);
    m_edit->setState(TEXT_DISABLED);
}

void SizeToolBox::resetInitializeStyle()
{
    clearFocusOfSizeBoxLineEdit(true);
    setFontSize({DEFAULT_SIZE});
    ToolBox::resetInitializeStyle();
}

void SizeToolBox::translateText()
{
    m_label->setText(tr("Size"));
    m_ptLabel->setText(tr("pt"));
    m_edit->setObjectName(
        QStringLiteral("%1#%2#%3")
            .arg(QString::number(KEYBOARD_KIND), tr("Font Size"), QString::fromLatin1(SELECT_ALL)));
}

// List and buttons

void SizeToolBox::fontSizeChanged(const QString& text)
{
    if (m_state == State::Writing)
        return;
    const bool wasEditing = isEditing();
    m_state = State::Shown;
    bool isNumber = false;
    const int size = text.toInt(&isNumber);
    if (isNumber)
        setAllSizes(size);
    if (wasEditing)
        leaveEditing();
}

void SizeToolBox::setAllSizes(int size)
{
    m_sizes.fill(size);
    showText(SizeLadder::displayText(m_sizes));
    updateButtons();
    Q_EMIT sizeChange(m_sizes, TextObjectConstants::PropertySize);
}

void SizeToolBox::fontSizeToNext()
{
    step(&SizeLadder::getNextData);
}

void SizeToolBox::fontSizeToPrevious()
{
    step(&SizeLadder::getPreviousData);
}

// Steps each size on its own, so that differences stay.
void SizeToolBox::step(int (*next)(int))
{
    clearFocusOfSizeBoxLineEdit(true);
    for (int& size : m_sizes)
        size = next(size);
    showText(SizeLadder::displayText(m_sizes));
    updateButtons();
    Q_EMIT sizeChange(m_sizes, TextObjectConstants::PropertySize);
}

// Typing

bool SizeToolBox::eventFilter(QObject* object, QEvent* event)
{
    if (object == m_edit && doLineEditEvent(event))
        return true;
    if (object != m_edit && object != m_box)
        return ToolBox::eventFilter(object, event);
    switch (static_cast<int>(event->type())) {
    case QEvent::KeyPress: {
        const int key = static_cast<QKeyEvent*>(event)->key();
        if (!isEditing() || (key != Qt::Key_Return && key != Qt::Key_Enter))
            return false;
        enterPressed();
        return true;
    }
    case QEvent::FocusOut: {
        // Switching to a window of another process, such as the keyboard itself, does not end the edit.
        const bool leftProcess = static_cast<QFocusEvent*>(event)->reason() == Qt::ActiveWindowFocusReason &&
                                 QGuiApplication::focusWindow() == nullptr;
        if (!leftProcess)
            editingLeft();
        return false;
    }
    case KSInputContext::SoftKeyBoardCloseType:
        editingLeft();
        return true;
    default:
        return false;
    }
}

// Turns a finger on the field into mouse events. Touches outside the field go to the box.
bool SizeToolBox::doLineEditEvent(QEvent* event)
{
    if (OneFinger::isTouch(event)) {
        event->accept();
        return m_finger->takes(event);
    }
    switch (event->type()) {
    case QEvent::MouseButtonPress:
    case QEvent::MouseButtonDblClick:
        if (!isBoxEnabled())
            return true;
        if (isEditing()) {
            m_edit->selectAll();
            return true;
        }
        setFocusForLineEdit();
        m_lastValidText = m_edit->text();
        m_state = State::Valid;
        return false;
    default:
        return false;
    }
}

// Called for each step of the finger.
void SizeToolBox::actOnLineEdit(QEvent::Type mouse)
{
    const bool wasEditing = isEditing();
    sendMouseToLineEdit(mouse, m_finger->positionIn(m_edit));
    if (mouse == QEvent::MouseButtonPress && !wasEditing && m_state == State::Valid)
        m_state = State::Touched;
    else if (mouse == QEvent::MouseButtonRelease && m_state == State::Touched)
        m_state = State::Valid;
}

void SizeToolBox::sendMouseToLineEdit(QEvent::Type type, const QPointF& position)
{
    const Qt::MouseButton button = type == QEvent::MouseMove ? Qt::NoButton : Qt::LeftButton;
    const Qt::MouseButtons held = type == QEvent::MouseButtonRelease ? Qt::NoButton : Qt::LeftButton;
    QMouseEvent mouse(type, position, m_edit->mapToGlobal(position), button, held, Qt::NoModifier);
    QCoreApplication::sendEvent(m_edit, &mouse);
}

// Called when the touch was cancelled: releases the field without a click and ends an edit that this touch
// began.
void SizeToolBox::letGoOfLineEdit()
{
    sendMouseToLineEdit(QEvent::MouseButtonRelease, QPointF(-1, -1));
    clearFocusOfSizeBoxLineEdit(m_state == State::Touched);
}

void SizeToolBox::setFocusForLineEdit()
{
    m_edit->setReadOnly(false);
    m_edit->setFocus(Qt::MouseFocusReason);
    KSInputContext::resetFocusWidget();
}

void SizeToolBox::setValid(bool valid)
{
    if (!isEditing())
        return;
    if (!valid)
        m_state = State::Invalid;
    else if (m_state == State::Invalid)
        m_state = State::Valid;
    KSInputContext* input = KSInputContext::instance();
    if (valid && input)
        input->showLimitInfo(SubCommonDefine::taLimitInfo());
}

void SizeToolBox::enterPressed()
{
    if (m_state != State::Invalid && m_edit->hasAcceptableInput()) {
        Q_EMIT validEditingText();
    } else {
        resetLastValidTextAndShowWarning();
        leaveEditing();
    }
}

void SizeToolBox::editSizeFinished()
{
    const int size = m_edit->text().toInt();
    // Otherwise the box would look for the row of this text and report it as a change.
    showText(QString::number(size));
    leaveEditing();
    setAllSizes(size);
}

// Called when the field was left without Enter: shows a warning if the text is not a size, and restores the
// last valid text.
void SizeToolBox::editingLeft()
{
    if (!isEditing())
        return;
    // The result of the validator has to be kept first: hasAcceptableInput() below validates the text of the
    // field and overwrites it.
    const bool wasValid = m_state != State::Invalid;
    m_state = State::Shown;
    if (wasValid && m_edit->hasAcceptableInput())
        showText(m_lastValidText);
    else
        resetLastValidTextAndShowWarning();
    leaveEditing();
}

void SizeToolBox::resetLastValidTextAndShowWarning()
{
    // The display of a mixed selection, such as "32+", was not edited.
    if (m_lastValidText.contains(QLatin1Char('+')) && m_edit->text() == m_lastValidText)
        return;
    showText(m_lastValidText);
    showWarningMessage();
}

void SizeToolBox::showWarningMessage()
{
    if (MessageBoxController* messages = MessageBoxController::getInstance())
        messages->postMessage(MessageDef::MESSAGE_SIZE_INVALID);
    m_edit->setReadOnly(true);
}

void SizeToolBox::clearFocusOfSizeBoxLineEdit(bool clear)
{
    if (!clear || !isEditing())
        return;
    showText(m_lastValidText);
    leaveEditing();
}

// Qt closes the soft keyboard only when an editable field loses the focus, and this field is read-only by
// then. The keyboard stays open if another field has it.
void SizeToolBox::closeKeyboard() const
{
    KSInputContext* input = KSInputContext::instance();
    if (input && !KSInputContext::isSoftKeyboardClosed() && input->getFocusWidget() == m_box)
        input->closeSoftKeyBoardWindow();
}

void SizeToolBox::leaveEditing()
{
    m_state = State::Shown;
    m_edit->deselect();
    closeKeyboard();
    m_edit->setReadOnly(true);
    m_box->clearFocus();
    Q_EMIT signalSizeToolBoxEditDone();
}
