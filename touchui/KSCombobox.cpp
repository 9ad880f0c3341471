#include "touchui/KSCombobox.h"

#include "touchui/BalloonWindow.h"
#include "touchui/CustomComboBoxDelegate.h"
#include "touchui/CustomComboBoxView.h"
#include "touchui/KSEventProcessLockObject.h"
#include "touchui/OutsidePressFilter.h"
#include "touchui/SliceFrame.h"

#include <QCoreApplication>
#include <QFontMetricsF>
#include <QFrame>
#include <QKeyEvent>
#include <QLayout>
#include <QLineEdit>
#include <QMouseEvent>
#include <QPainter>
#include <QProxyStyle>
#include <QStandardItemModel>
#include <QStyleOptionComboBox>
#include <QtMath>

#include <algorithm>

namespace
{

constexpr int FRAME = 8;        // of the list's window
constexpr int TEXT_MARGIN = 10; // of the closed box
constexpr int WITHOUT_BAR = 44; // width of a list in addition to its longest text
constexpr int WITH_BAR = 76;    // the same for a list with a scroll bar
constexpr int TEXT_PIXELS = 24;
const QColor TEXT_COLOR(220, 220, 220);
const QColor DISABLED_COLOR(102, 102, 102);

// Requests a scrolling list instead of a menu that covers the box.
class ComboStyle : public QProxyStyle
{
public:
    ComboStyle() : QProxyStyle(QStringLiteral("Fusion")) {}

    int styleHint(StyleHint hint, const QStyleOption* option, const QWidget* widget,
                  QStyleHintReturn* returnData) const override
    {
        switch (hint) {
        case SH_ComboBox_Popup:
        case SH_Menu_FlashTriggeredItem:
        case SH_Menu_FadeOutOnHide:
            return 0;
        case SH_ComboBox_PopupFrameStyle: // the list paints its own frame
            return QFrame::NoFrame;
        default:
            return QProxyStyle::styleHint(hint, option, widget, returnData);
        }
    }
};

SliceFrame listFrame()
{
    static const QStringList paths = SliceFrame::family(QStringLiteral(":/Dialog/Dialog_base_"));
    return SliceFrame(paths);
}

} // namespace

KSCombobox::KSCombobox(QWidget* parent)
    : QComboBox(parent), m_view(new CustomComboBoxView), m_delegate(new CustomComboBoxDelegate(this))
{
    auto* look = new ComboStyle;
    look->setParent(this);
    setStyle(look);
    setAttribute(Qt::WA_AcceptTouchEvents);
    setFocusPolicy(Qt::NoFocus);
    QFont textFont = font();
    textFont.setPixelSize(TEXT_PIXELS);
    setFont(textFont);
    // Make the field of an editable box transparent, so that the pictures behind it are visible.
    QPalette colors = palette();
    colors.setColor(QPalette::Base, Qt::transparent);
    for (const QPalette::ColorGroup group : {QPalette::Active, QPalette::Inactive})
        colors.setColor(group, QPalette::Text, TEXT_COLOR);
    colors.setColor(QPalette::Disabled, QPalette::Text, DISABLED_COLOR);
    setPalette(colors);
    setView(m_view);
    setItemDelegate(m_delegate);
    connect(&m_finger, &OneFinger::acted, this, &KSCombobox::sendMouse);
    connect(&m_finger, &OneFinger::cancelled, this, &KSCombobox::comeUp);
    connect(m_view, &CustomComboBoxView::signalTapped, this, &KSCombobox::choose);
    setBackgroundImagesPath(QStringLiteral(":/TextToolPanel_TextBox/TextBox_Edittable"));
    initPopup();
}

KSCombobox::~KSCombobox()
{
    m_popup->removeEventFilter(this);
    if (m_shown && KSEventProcessLockObject::s_instance != nullptr)
        KSEventProcessLockObject::s_instance->tryUnlock(this, LOCKMETHOD_OTHER);
}

// Configures the window in which the base class shows the list.
void KSCombobox::initPopup()
{
    m_popup = m_view->parentWidget();
    m_view->removeEventFilter(m_popup);
    m_view->viewport()->removeEventFilter(m_popup);
    m_popup->setWindowFlags(Qt::ToolTip | Qt::FramelessWindowHint | Qt::NoDropShadowWindowHint |
                            Qt::WindowDoesNotAcceptFocus);
    m_popup->setAttribute(Qt::WA_TranslucentBackground);
    m_popup->setAttribute(Qt::WA_ShowWithoutActivating);
    m_popup->setAttribute(Qt::WA_X11NetWmWindowTypeCombo, false);
    m_popup->layout()->setContentsMargins(FRAME, FRAME, FRAME, FRAME);
    m_popup->installEventFilter(this);
    m_outsidePress = new OutsidePressFilter(m_popup, this);
    connect(m_outsidePress, &OutsidePressFilter::pressedOutside, this, &KSCombobox::hidePopup);
}

void KSCombobox::setBackgroundImagesPath(const QString& path)
{
    const auto load = [&path](Slices& slices, const QString& state) {
        const char* const names[] = {"_Left", "_Center", "_Pulldown"};
        for (std::size_t i = 0; i < slices.size(); ++i)
            slices[i] = QPixmap(path + state + QLatin1String(names[i]));
    };
    load(m_rest, QString());
    load(m_pressedSlices, QStringLiteral("_Pressed"));
    load(m_disabledSlices, QStringLiteral("_Disable"));
    update();
}

void KSCombobox::setColorPallete(bool on)
{
    m_delegate->setColorPallete(on);
    update();
}

void KSCombobox::setUSBEnabled(bool enabled)
{
    auto* items = qobject_cast<QStandardItemModel*>(model());
    if (items == nullptr)
        return;
    for (int row = 0; row < items->rowCount(); ++row) {
        QStandardItem* item = items->item(row);
        if (item != nullptr && item->data(USB_ROLE).toBool())
            item->setEnabled(enabled);
    }
}

void KSCombobox::setEnabled(bool enabled)
{
    QComboBox::setEnabled(enabled);
}

void KSCombobox::setDisabled(bool disabled)
{
    QComboBox::setDisabled(disabled);
}

void KSCombobox::showPopup()
{
    if (m_popup->isVisible())
        return;
    Q_EMIT signalPopupShow();
    if (count() == 0 || !m_popupEnable || !QWidget::isEnabled())
        return;
    m_shown = true;
    // Announce the open list, so that it is closed when another process needs the touch.
    if (KSEventProcessLockObject::s_instance != nullptr)
        KSEventProcessLockObject::s_instance->tryLock(this, LOCKMETHOD_OTHER, nullptr);
    Q_EMIT signalShowComboxList(true);
    m_view->setFont(font());
    adjustPopupListSize();
    adjustPopupListPostion();
    m_popup->show();
    m_popup->raise();
    const QModelIndex current = model()->index(currentIndex(), modelColumn(), rootModelIndex());
    m_view->setCurrentIndex(current);
    m_view->scrollTo(current, QAbstractItemView::PositionAtCenter);
    m_outsidePress->start();
}

void KSCombobox::hidePopup()
{
    QComboBox::hidePopup();
}

void KSCombobox::popupHidden()
{
    m_outsidePress->stop();
    setPressed(false);
    if (!m_shown)
        return;
    m_shown = false;
    if (KSEventProcessLockObject::s_instance != nullptr)
        KSEventProcessLockObject::s_instance->tryUnlock(this, LOCKMETHOD_OTHER);
    Q_EMIT signalShowComboxList(false);
}

int KSCombobox::listWidth(int width, int textWidth, bool byText, bool withScrollBar)
{
    if (!byText || width >= textWidth + WITHOUT_BAR)
        return width;
    return textWidth + (withScrollBar ? WITH_BAR : WITHOUT_BAR);
}

void KSCombobox::setListWidth(int width, int textWidth)
{
    const int wanted = listWidth(width, textWidth, m_listWidthByText, count() > maxVisibleItems());
    m_popup->setFixedWidth(qMin(wanted, BalloonWindow::bounds(nullptr, mapToGlobal(QPoint())).width()));
}

int KSCombobox::longestTextWidth() const
{
    int longest = 0;
    for (int row = 0; row < count(); ++row)
        longest = qMax(longest, qCeil(QFontMetricsF(font()).horizontalAdvance(itemText(row))));
    return longest;
}

void KSCombobox::adjustPopupListSize()
{
    setListWidth(width(), m_listWidthByText ? longestTextWidth() : 0);
    const int rowHeight = qMax(1, m_view->sizeHintForRow(0));
    const int room = BalloonWindow::bounds(nullptr, mapToGlobal(QPoint())).height() - 2 * FRAME;
    const int rows = qMax(1, qMin(qMin(count(), maxVisibleItems()), room / rowHeight));
    m_popup->setFixedHeight(rows * rowHeight + 2 * FRAME);
    m_view->setVerticalScrollBarPolicy(rows < count() ? Qt::ScrollBarAlwaysOn : Qt::ScrollBarAlwaysOff);
}

void KSCombobox::adjustPopupListPostion()
{
    const QRect box(mapToGlobal(QPoint(0, 0)), size());
    const QRect bounds = BalloonWindow::bounds(nullptr, box.center());
    const QSize list = m_popup->size();
    const int below = box.y() + box.height();
    const int above = box.y() - list.height();
    const bool fitsBelow = below + list.height() <= bounds.y() + bounds.height();
    const bool fitsAbove = above >= bounds.y();
    const bool upper = m_popupUpper ? fitsAbove || !fitsBelow : !fitsBelow && fitsAbove;
    const int x = qMax(qMin(box.x(), bounds.x() + bounds.width() - list.width()), bounds.x());
    const int lowest = bounds.y() + bounds.height() - list.height();
    m_popup->move(x, qMax(qMin(upper ? above : below, lowest), bounds.y()));
}

void KSCombobox::choose(const QModelIndex& index)
{
    const int row = index.row();
    hidePopup();
    setCurrentIndex(row);
    Q_EMIT textActivated(itemText(row));
    Q_EMIT activated(row);
}

bool KSCombobox::eventFilter(QObject* obj, QEvent* event)
{
    if (obj == m_popup)
        return KeyEventFilter(obj, event) || handlePopupWidgetEvent(obj, event);
    return QComboBox::eventFilter(obj, event);
}

bool KSCombobox::KeyEventFilter(QObject*, QEvent* event)
{
    if (event->type() != QEvent::KeyPress)
        return false;
    const QModelIndex current = m_view->currentIndex();
    switch (static_cast<QKeyEvent*>(event)->key()) {
    case Qt::Key_Escape:
        hidePopup();
        break;
    case Qt::Key_Return:
    case Qt::Key_Enter:
        if (current.isValid() && (current.flags() & Qt::ItemIsEnabled))
            choose(current);
        break;
    case Qt::Key_Up:
    case Qt::Key_Down: {
        const int step = static_cast<QKeyEvent*>(event)->key() == Qt::Key_Up ? -1 : 1;
        const QModelIndex next = current.siblingAtRow(current.row() + step);
        if (next.isValid())
            m_view->setCurrentIndex(next);
        break;
    }
    default:
        break;
    }
    return true;
}

bool KSCombobox::handlePopupWidgetEvent(QObject*, QEvent* event)
{
    switch (event->type()) {
    case QEvent::Paint:
        drawPopListTranslucent(m_popup);
        return true;
    case QEvent::Show: // the base class removes the mask when the size changes
        m_popup->setMask(listFrame().mask(m_popup->size()));
        return false;
    case QEvent::Hide:
        popupHidden();
        return false;
    // Presses on the frame beside the rows are ignored.
    case QEvent::MouseButtonPress:
    case QEvent::MouseButtonRelease:
    case QEvent::MouseMove:
        return true;
    default:
        return false;
    }
}

void KSCombobox::drawPopListTranslucent(QWidget* popup)
{
    QPainter painter(popup);
    painter.setCompositionMode(QPainter::CompositionMode_Source);
    painter.fillRect(popup->rect(), Qt::transparent);
    painter.setCompositionMode(QPainter::CompositionMode_SourceOver);
    listFrame().paint(painter, popup->rect());
}

bool KSCombobox::event(QEvent* event)
{
    if (event->type() == QEvent::Type(KSEventProcessLockObject::RESTORE_ORIGINAL_TYPE)) {
        hidePopup();
        return true;
    }
    return m_finger.takes(event) || QComboBox::event(event);
}

// Releases the box and, if its line edit is pressed, releases that without a click.
void KSCombobox::comeUp()
{
    setPressed(false);
    if (QLineEdit* edit = lineEdit()) {
        const QPoint outside(-1, -1);
        QMouseEvent release(QEvent::MouseButtonRelease, outside, edit->mapToGlobal(outside), Qt::LeftButton,
                            Qt::NoButton, Qt::NoModifier);
        QCoreApplication::sendEvent(edit, &release);
    }
}

void KSCombobox::sendMouse(QEvent::Type type)
{
    const QPoint position = m_finger.positionIn(this).toPoint();
    const QPoint globalPosition = m_finger.position().toPoint();
    QMouseEvent event = OneFinger::mouseEvent(type, position, globalPosition);
    QLineEdit* edit = lineEdit();
    if (edit != nullptr && edit->geometry().contains(position)) {
        QMouseEvent inEdit = OneFinger::mouseEvent(type, edit->mapFrom(this, position), globalPosition);
        QCoreApplication::sendEvent(edit, &inEdit);
    } else if (type == QEvent::MouseButtonPress) {
        mousePressEvent(&event);
    } else if (type == QEvent::MouseMove) {
        mouseMoveEvent(&event);
    } else {
        mouseReleaseEvent(&event);
    }
}

void KSCombobox::mousePressEvent(QMouseEvent* event)
{
    setPressed(event->button() == Qt::LeftButton);
    QComboBox::mousePressEvent(event);
}

void KSCombobox::mouseReleaseEvent(QMouseEvent* event)
{
    setPressed(false);
    QComboBox::mouseReleaseEvent(event);
}

void KSCombobox::setPressed(bool pressed)
{
    if (m_pressed != pressed) {
        m_pressed = pressed;
        update();
    }
}

void KSCombobox::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::EnabledChange && !QWidget::isEnabled()) {
        setPressed(false);
        hidePopup();
    }
    QComboBox::changeEvent(event);
}

void KSCombobox::moveEvent(QMoveEvent* event)
{
    QComboBox::moveEvent(event);
    if (m_popup != nullptr && m_popup->isVisible())
        adjustPopupListPostion();
}

void KSCombobox::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    painter.setRenderHint(QPainter::SmoothPixmapTransform);
    const bool enabled = QWidget::isEnabled();
    const Slices* slices = &m_rest;
    if (!enabled && !m_disabledSlices[1].isNull())
        slices = &m_disabledSlices;
    else if (m_pressed && !m_pressedSlices[1].isNull())
        slices = &m_pressedSlices;
    const NineSlice::Triple cells = NineSlice::row(rect(), (*slices)[0].width(), (*slices)[2].width());
    for (std::size_t i = 0; i < cells.size(); ++i)
        if (!(*slices)[i].isNull() && !cells[i].isEmpty())
            painter.drawPixmap(cells[i], (*slices)[i]);
    if (isEditable() || currentIndex() < 0)
        return;
    const QRect area = rect().adjusted(TEXT_MARGIN, 0, -qMax((*slices)[2].width(), TEXT_MARGIN), 0);
    const QModelIndex index = model()->index(currentIndex(), modelColumn(), rootModelIndex());
    if (m_delegate->colorPallete() && CustomComboBoxDelegate::rowColor(index).isValid()) {
        painter.fillRect(area.adjusted(0, TEXT_MARGIN, 0, -TEXT_MARGIN),
                         CustomComboBoxDelegate::rowColor(index));
        return;
    }
    painter.setFont(font());
    painter.setPen(enabled ? TEXT_COLOR : DISABLED_COLOR);
    drawText(painter, area);
}

void KSCombobox::drawText(QPainter& painter, const QRect& area)
{
    painter.drawText(area, Qt::AlignLeft | Qt::AlignVCenter | Qt::TextSingleLine,
                     painter.fontMetrics().elidedText(currentText(), Qt::ElideRight, area.width()));
}
