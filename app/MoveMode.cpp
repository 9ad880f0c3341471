#include "app/MoveMode.h"

#include "touchui/KSPushbutton.h"

#include <QCoreApplication>
#include <QMouseEvent>
#include <QTouchEvent>
#include <optional>

namespace
{

constexpr QSize BUTTON_SIZE(70, 38);

const char BUTTON_IMAGES[] =
    "TextToolPanel_Buttons:Button-38B_Rest_Left:Button-38B_Rest_Center:Button-38B_Rest_Right:"
    "Button-38B_Pressed_Left:Button-38B_Pressed_Center:Button-38B_Pressed_Right::::"
    "Button-38selected_Rest_Left:Button-38selected_Rest_Center:Button-38selected_Rest_Right:"
    "Button-38selected_Pressed_Left:Button-38selected_Pressed_Center:Button-38selected_Pressed_Right:::";

// Returns the global position of a press or wheel event; nothing for other events.
std::optional<QPoint> placeOfPress(const QEvent* event)
{
    switch (event->type()) {
    case QEvent::MouseButtonDblClick:
    case QEvent::MouseButtonPress:
    case QEvent::Wheel:
        return static_cast<const QSinglePointEvent*>(event)->globalPosition().toPoint();
    case QEvent::TouchBegin: {
        const auto& points = static_cast<const QTouchEvent*>(event)->points();
        if (points.isEmpty())
            return std::nullopt;
        return points.first().globalPosition().toPoint();
    }
    default:
        return std::nullopt;
    }
}

bool covers(const QWidget* widget, const QPoint& global)
{
    return QRect(widget->mapToGlobal(QPoint(0, 0)), widget->size()).contains(global);
}

} // namespace

MoveMode::MoveMode(QWidget* parent) : m_button(new KSPushbutton(QString::fromLatin1(BUTTON_IMAGES), parent))
{
    m_button->setFixedSize(BUTTON_SIZE);
    translateText();
    m_button->setStyleSheet(QStringLiteral("color:rgb(220, 220, 220); font:20px;"));
    m_button->setFocusPolicy(Qt::NoFocus);
    m_button->setAttribute(Qt::WA_AcceptTouchEvents);
}

void MoveMode::setOn(bool on)
{
    m_state = on ? State::On : State::Off;
    translateText();
    m_button->changeButtonState(on ? KSPushbutton::ButtonSelectedRest : KSPushbutton::ButtonRest);
    m_button->setSelected(on);
}

void MoveMode::showPressed()
{
    m_button->changeButtonState(m_button->isSelected() ? KSPushbutton::ButtonSelectedPressed
                                                       : KSPushbutton::ButtonPressed);
}

void MoveMode::showReleased()
{
    m_button->changeButtonState(m_button->isSelected() ? KSPushbutton::ButtonSelectedRest
                                                       : KSPushbutton::ButtonRest);
}

void MoveMode::translateText()
{
    m_button->setText(isOn() ? QCoreApplication::translate("TitlerWindow", "Done")
                             : QCoreApplication::translate("TitlerWindow", "Move"));
}

bool MoveMode::isEndedBy(const QObject* receiver, const QEvent* event, const QWidget* list) const
{
    if (!isOn() || receiver == m_button)
        return false;
    const std::optional<QPoint> place = placeOfPress(event);
    // The window that contains the button receives a press on it first.
    return place && !covers(list, *place) && !covers(m_button, *place);
}
