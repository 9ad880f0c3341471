#include "library/FolderEditor.h"

#include "library/EditorRegExpValidator.h"
#include "library/FolderNameRules.h"
#include "touchui/KSInputContext.h"
#include "touchui/NineSlice.h"

#include <QKeyEvent>
#include <QMouseEvent>
#include <QPainter>

const QString FolderEditor::FOLDER_PICKER_REGEXP = FolderNameRules::PATTERN;
const QString FolderEditor::LEFT_IMAGE = QStringLiteral(":/TextToolPanel_TextBox/TextBox_Edittable_Left");
const QString FolderEditor::CENTER_IMAGE = QStringLiteral(":/TextToolPanel_TextBox/TextBox_Edittable_Center");
const QString FolderEditor::RIGHT_IMAGE = QStringLiteral(":/TextToolPanel_TextBox/TextBox_Edittable_Right");

namespace
{

const int FONT_SIZE = 24;
const int TEXT_MARGIN = 6;

} // namespace

FolderEditor::FolderEditor(QWidget* parent)
    : QLineEdit(parent), m_left(LEFT_IMAGE), m_center(CENTER_IMAGE), m_right(RIGHT_IMAGE)
{
    setFocusPolicy(Qt::StrongFocus);
    setContextMenuPolicy(Qt::NoContextMenu);
    setAttribute(Qt::WA_AcceptTouchEvents); // otherwise the list below it handles the touch
    setFrame(false);
    QFont nameFont = font();
    nameFont.setPixelSize(FONT_SIZE);
    setFont(nameFont);
    setStyleSheet(
        QStringLiteral("background: transparent; border: 0px; font-size: %1px; color: rgb(220, 220, 220);"
                       "selection-background-color: rgb(0, 129, 255); selection-color: rgb(255, 255, 255);")
            .arg(FONT_SIZE));
    const QRect text = getTextRect();
    setTextMargins(text.left(), 0, width() - text.right() - 1, 0);

    connect(&m_finger, &OneFinger::acted, this,
            [this](QEvent::Type type) { sendMouse(type, m_finger.position()); });
    // A release outside the field ends the press without a click.
    connect(&m_finger, &OneFinger::cancelled, this,
            [this] { sendMouse(QEvent::MouseButtonRelease, mapToGlobal(QPointF(-1, -1))); });

    auto* checker = new EditorRegExpValidator(FOLDER_PICKER_REGEXP, this);
    setValidator(checker);
    connect(checker, &EditorRegExpValidator::invalidText, this, &FolderEditor::signalInvalidInput);
    connect(checker, &EditorRegExpValidator::longText, this, &FolderEditor::signalLongInput);
    connect(checker, &EditorRegExpValidator::validText, this, &FolderEditor::signalValidInput);
}

QRect FolderEditor::getTextRect() const
{
    return rect().adjusted(qMax(TEXT_MARGIN, m_left.width()), 0, -qMax(TEXT_MARGIN, m_right.width()), 0);
}

bool FolderEditor::event(QEvent* event)
{
    if (event->type() == QEvent::Type(KSInputContext::SoftKeyBoardCloseType)) {
        Q_EMIT signalPressedClose();
        return true;
    }
    return m_finger.takes(event) || QLineEdit::event(event);
}

void FolderEditor::sendMouse(QEvent::Type type, const QPointF& globalPosition)
{
    QMouseEvent mouse = OneFinger::mouseEvent(type, mapFromGlobal(globalPosition), globalPosition);
    if (type == QEvent::MouseButtonPress)
        mousePressEvent(&mouse);
    else if (type == QEvent::MouseButtonRelease)
        mouseReleaseEvent(&mouse);
    else
        mouseMoveEvent(&mouse);
}

void FolderEditor::keyPressEvent(QKeyEvent* event)
{
    switch (event->key()) {
    case Qt::Key_Enter:
    case Qt::Key_Return:
        event->accept();
        Q_EMIT signalPressedEnter();
        return;
    case Qt::Key_Escape:
        event->accept();
        Q_EMIT signalPressedEscape();
        return;
    default:
        QLineEdit::keyPressEvent(event);
    }
}

void FolderEditor::paintEvent(QPaintEvent* event)
{
    {
        QPainter painter(this);
        drawFrame(painter);
    }
    QLineEdit::paintEvent(event);
}

void FolderEditor::drawFrame(QPainter& painter) const
{
    const NineSlice::Triple places = NineSlice::row(rect(), m_left.width(), m_right.width());
    const QPixmap* pieces[] = {&m_left, &m_center, &m_right};
    for (size_t i = 0; i < places.size(); ++i)
        if (!pieces[i]->isNull() && !places[i].isEmpty())
            painter.drawPixmap(places[i], *pieces[i]);
}

// Reports the end of the edit when the editor itself is hidden together with its row, but not when the dialog
// is hidden.
void FolderEditor::hideEvent(QHideEvent* event)
{
    QLineEdit::hideEvent(event);
    if (isHidden() && !m_ended) {
        m_ended = true;
        Q_EMIT signalEditStateEnd();
    }
}
