#include "app/ToolsBar.h"

#include "app/APPEventFilter.h"
#include "canvas/DrawBoundingRectangle.h"
#include "support/LogManager.h"
#include "touchui/KSPushbutton.h"
#include "touchui/NewLayout.h"
#include "touchui/OutsidePressFilter.h"

#include <QAction>
#include <QBitmap>
#include <QHBoxLayout>
#include <QLabel>
#include <QMenu>
#include <QMouseEvent>
#include <QPainter>
#include <QPixmap>
#include <QVBoxLayout>

const QSize ToolsBar::BAR_ICON_SIZE(120, 67);
const QSize ToolsBar::TOOLBARBTN_SIZE(120, 67);
const QPoint ToolsBar::BTNS_TEXT_POINT(0, 40);
const QPoint ToolsBar::CANVASBTN_TEXT_POINT(-8, 40);
const QColor ToolsBar::TRANSPARENT_COLOR(0, 0, 0, 0);

namespace
{

constexpr int FIRST_SPACING = 48;
constexpr int BUTTON_SPACING = 46;
constexpr QSize MENU_SIZE(200, 210);
constexpr int MENU_BACKGROUND_KIND = 9;
constexpr int MENU_ITEMS = 3;
constexpr int MENU_TEXT_INDENT = 12;

const char LABEL_STYLE[] = "background-color:transparent; color:rgb(220, 220, 220); font:20px;";
const char LABEL_DISABLED_STYLE[] = "background-color:transparent; color:rgb(102, 102, 102); font:20px;";

// No background at rest and while disabled.
const char TOOL_IMAGES[] =
    "ToolsBar_Buttons::::"
    "Button_67_Pressed_Left:Button_67_Pressed_Center:Button_67_Pressed_Right::::"
    "Button_67selected_Rest_Left:Button_67selected_Rest_Center:Button_67selected_Rest_Right:"
    "Button_67selected_Pressed_Left:Button_67selected_Pressed_Center:Button_67selected_Pressed_Right:::";

void logTap(const wchar_t* text)
{
    LOG_USER_OPERATE(L"Tool Area", 200, text);
}

} // namespace

ToolsBar::ToolsBar(QAction* undo, QAction* redo, QWidget* parent)
    : QWidget(parent), m_undoAction(undo), m_redoAction(redo)
{
    setStyleSheet(QStringLiteral("QPushButton {border:0;background-color:transparent;};"));
    createButtons();
    createMenu();
    createLayout();
    createConnection();
    translateText();
    resetToDefaultState();
    if (APPEventFilter* filter = APPEventFilter::instance())
        filter->registerEventFilter(this);
}

ToolsBar::~ToolsBar() = default;

ToolsBar::ToolButton ToolsBar::createButton(const QString& iconName, const QPoint& textPoint)
{
    ToolButton tool;
    // From a name without suffix, an icon reads the database of MIME types.
    tool.icon = QIcon(QPixmap(QStringLiteral(":/Icon_") + iconName));
    tool.disabledIcon = QIcon(QPixmap(QStringLiteral(":/Icon_Disabled_") + iconName));
    tool.button = new KSPushbutton(QString::fromLatin1(TOOL_IMAGES), this);
    tool.button->setObjectName(iconName);
    tool.button->setFixedSize(TOOLBARBTN_SIZE);
    tool.button->setIconSize(BAR_ICON_SIZE);
    tool.button->setIcon(tool.icon);
    tool.label = new QLabel(tool.button);
    tool.label->setAttribute(Qt::WA_TransparentForMouseEvents);
    tool.label->setAlignment(Qt::AlignCenter);
    tool.label->setGeometry(
        QRect(textPoint, QSize(BTNS_TEXTLABEL_WIDTH, TOOLBARBTN_SIZE.height() - textPoint.y())));
    tool.label->setStyleSheet(QString::fromLatin1(LABEL_STYLE));
    return tool;
}

void ToolsBar::createButtons()
{
    m_folder = createButton(QStringLiteral("Folder"), BTNS_TEXT_POINT);
    m_text = createButton(QStringLiteral("Text"), BTNS_TEXT_POINT);
    m_text.button->setCheckable(true);
    m_delete = createButton(QStringLiteral("Delete"), BTNS_TEXT_POINT);
    m_undo = createButton(QStringLiteral("Undo"), BTNS_TEXT_POINT);
    m_redo = createButton(QStringLiteral("Redo"), BTNS_TEXT_POINT);
    m_safeArea = createButton(QStringLiteral("SafeArea"), BTNS_TEXT_POINT);
    m_canvas = createButton(QStringLiteral("Canvas"), CANVASBTN_TEXT_POINT);
    m_close = createButton(QStringLiteral("Close"), BTNS_TEXT_POINT);
}

void ToolsBar::createMenu()
{
    m_menu = new QMenu(this);
    // Not a popup: Qt delivers no touches while one is open, so a finger that opened it by sliding off the
    // button would never be released.
    m_menu->setWindowFlags(Qt::ToolTip | Qt::FramelessWindowHint | Qt::NoDropShadowWindowHint |
                           Qt::WindowDoesNotAcceptFocus);
    m_menu->setAttribute(Qt::WA_TranslucentBackground);
    m_menu->setAttribute(Qt::WA_ShowWithoutActivating);
    for (int i = 0; i < MENU_ITEMS; ++i)
        m_menu->addAction(QString())->setData(i);
    m_menu->setFixedSize(MENU_SIZE);
    m_menuCursor = QPixmap(QStringLiteral(":/Menu/List_Cursor"));
    m_menuSeparator = QPixmap(QStringLiteral(":/Separator_H"));
    m_outsidePress = new OutsidePressFilter(m_menu, this);
    connect(m_outsidePress, &OutsidePressFilter::pressedOutside, this, &ToolsBar::hideCanvasMenu);
}

void ToolsBar::createLayout()
{
    auto* undoGroup = newLayout<QHBoxLayout>();
    undoGroup->addWidget(m_undo.button);
    undoGroup->addSpacing(BUTTON_SPACING);
    undoGroup->addWidget(m_redo.button);

    auto* row = newLayout<QHBoxLayout>();
    row->addSpacing(FIRST_SPACING);
    for (const ToolButton* tool : {&m_folder, &m_text, &m_delete}) {
        row->addWidget(tool->button);
        row->addSpacing(BUTTON_SPACING);
    }
    row->addLayout(undoGroup);
    for (const ToolButton* tool : {&m_safeArea, &m_canvas, &m_close}) {
        row->addSpacing(BUTTON_SPACING);
        row->addWidget(tool->button);
    }
    row->addStretch();

    auto* column = newLayout<QVBoxLayout>();
    column->addLayout(row);
    setLayout(column);
}

void ToolsBar::createConnection()
{
    connect(m_folder.button, &QAbstractButton::clicked, this, &ToolsBar::clickedFolderButton);
    connect(m_text.button, &QAbstractButton::clicked, this, &ToolsBar::clickedInsertButton);
    connect(m_delete.button, &QAbstractButton::clicked, this, &ToolsBar::clickedDeleteButton);
    connect(m_close.button, &QAbstractButton::clicked, this, &ToolsBar::clickedCloseButton);
    connect(m_undo.button, &QAbstractButton::clicked, this, &ToolsBar::slotUndoButtonClicked);
    connect(m_redo.button, &QAbstractButton::clicked, this, &ToolsBar::slotRedoButtonClicked);
    connect(this, &ToolsBar::exeUndoAction, m_undoAction, [this] { Q_EMIT m_undoAction->triggered(false); });
    connect(this, &ToolsBar::exeRedoAction, m_redoAction, [this] { Q_EMIT m_redoAction->triggered(false); });
    connect(m_undoAction, &QAction::changed, this, &ToolsBar::setUndoButtonEnabled);
    connect(m_redoAction, &QAction::changed, this, &ToolsBar::setRedoButtonEnabled);
    connect(m_safeArea.button, &QAbstractButton::clicked, this, &ToolsBar::clickedSafeAreaButton);
    connect(m_canvas.button, &QAbstractButton::released, this, &ToolsBar::showCanvasMenu);
    connect(this, &ToolsBar::menuTriggered, m_menu, &QMenu::triggered);
    connect(m_menu, &QMenu::triggered, this, &ToolsBar::canvasButtonClicked);
    connect(m_menu, &QMenu::aboutToShow, this, &ToolsBar::canvasBtnSelected);
    connect(m_menu, &QMenu::aboutToHide, this, &ToolsBar::canvasBtnReleased);
    connectLooks();
}

void ToolsBar::connectLooks()
{
    for (const ToolButton* tool : {&m_folder, &m_text, &m_delete, &m_undo, &m_redo, &m_safeArea, &m_close}) {
        connect(tool->button, &QAbstractButton::pressed, this, [this, tool] { showPressed(*tool); });
        connect(tool->button, &QAbstractButton::released, this, [this, tool] { showReleased(*tool); });
    }
}

void ToolsBar::translateText()
{
    m_folder.label->setText(tr("Folder"));
    m_text.label->setText(tr("New Text"));
    m_delete.label->setText(tr("Delete"));
    m_undo.label->setText(tr("Undo"));
    m_redo.label->setText(tr("Redo"));
    m_safeArea.label->setText(tr("Safe Area"));
    m_canvas.label->setText(tr("Canvas"));
    m_close.label->setText(tr("Close"));
    const QString items[MENU_ITEMS] = {tr("Black"), tr("White"), tr("Checker")};
    const QList<QAction*> actions = m_menu->actions();
    for (int i = 0; i < MENU_ITEMS; ++i)
        actions.at(i)->setText(items[i]);
    m_menu->setFixedSize(MENU_SIZE);
    m_menu->update();
}

// Taps

void ToolsBar::clickedFolderButton()
{
    logTap(L"Tap Folder Button");
    Q_EMIT folderButtonClick();
}

void ToolsBar::clickedInsertButton()
{
    logTap(L"Tap New Text Button");
    Q_EMIT newTextButtonClick();
}

void ToolsBar::clickedDeleteButton()
{
    logTap(L"Tap Delete Button");
    Q_EMIT deleteButtonClick();
}

void ToolsBar::clickedCloseButton()
{
    logTap(L"Tap Close Button");
    Q_EMIT closeButtonClick();
}

void ToolsBar::slotUndoButtonClicked()
{
    logTap(L"Tap Undo Button");
    Q_EMIT undoButtonClicked();
    Q_EMIT exeUndoAction();
}

void ToolsBar::slotRedoButtonClicked()
{
    logTap(L"Tap Redo Button");
    Q_EMIT redoButtonClicked();
    Q_EMIT exeRedoAction();
}

void ToolsBar::clickedSafeAreaButton()
{
    logTap(L"Tap Safe Area Button");
    m_safeAreaShown = !m_safeAreaShown;
    showReleased(m_safeArea);
    Q_EMIT SafeAreaButtonClicked();
    Q_EMIT SafeAreaButtonClickedForDrawRect(m_safeAreaShown);
}

// Switches the safe area off, also on the canvas.
void ToolsBar::resetSafeArea()
{
    const bool wasShown = m_safeAreaShown;
    m_safeAreaShown = false;
    showReleased(m_safeArea);
    if (wasShown)
        Q_EMIT SafeAreaButtonClickedForDrawRect(false);
}

// States

void ToolsBar::setToolEnabled(const ToolButton& tool, bool enabled)
{
    tool.button->setIcon(enabled ? tool.icon : tool.disabledIcon);
    tool.label->setStyleSheet(QString::fromLatin1(enabled ? LABEL_STYLE : LABEL_DISABLED_STYLE));
    if (enabled) {
        tool.button->setEnabled(true);
        tool.button->changeButtonState(KSPushbutton::ButtonRest);
    } else {
        // The other buttons keep their touches: a timer that pushes an undo step disables Redo at any time,
        // even while a finger is on another widget.
        if (tool.button->isDown() || tool.button == m_text.button)
            setPushButtonDisabled(tool.button);
        else
            tool.button->setEnabled(false);
        tool.button->changeButtonState(KSPushbutton::ButtonDisabled);
    }
}

// Unlocks the touch gate: a button that is disabled under the finger does not receive the end of the touch
// and would keep the lock.
void ToolsBar::setPushButtonDisabled(QPushButton* button)
{
    button->setEnabled(false);
    if (APPEventFilter* filter = APPEventFilter::instance())
        filter->unlock();
}

void ToolsBar::setUndoButtonEnabled()
{
    setToolEnabled(m_undo, m_undoAction->isEnabled());
}

void ToolsBar::setRedoButtonEnabled()
{
    setToolEnabled(m_redo, m_redoAction->isEnabled());
}

void ToolsBar::changeBtnStatus(bool hasSelectedItem)
{
    setToolEnabled(m_delete, hasSelectedItem);
}

void ToolsBar::slotDisableNewTextButton(bool disable)
{
    if (disable)
        setToolEnabled(m_text, false);
    else if (!m_text.button->isEnabled())
        setToolEnabled(m_text, true);
}

void ToolsBar::setFolderButtonEnabled(bool enabled)
{
    setToolEnabled(m_folder, enabled);
}

void ToolsBar::setFolderButtonRest()
{
    m_folder.button->changeButtonState(KSPushbutton::ButtonRest);
}

void ToolsBar::resetToDefaultState()
{
    setToolEnabled(m_delete, false);
    setToolEnabled(m_undo, false);
    setToolEnabled(m_redo, false);
    resetSafeArea();
}

void ToolsBar::setInsertUnchecked()
{
    m_text.button->setChecked(false);
}

void ToolsBar::slotlCanvasSceneMousePressed()
{
}

// Looks

bool ToolsBar::isSelected(const ToolButton& tool) const
{
    return &tool == &m_safeArea && m_safeAreaShown;
}

void ToolsBar::showPressed(const ToolButton& tool)
{
    tool.button->changeButtonState(isSelected(tool) ? KSPushbutton::ButtonSelectedPressed
                                                    : KSPushbutton::ButtonPressed);
}

void ToolsBar::showReleased(const ToolButton& tool)
{
    tool.button->changeButtonState(isSelected(tool) ? KSPushbutton::ButtonSelectedRest
                                                    : KSPushbutton::ButtonRest);
}

// The Canvas menu

void ToolsBar::showCanvasMenu()
{
    if (m_canvas.button->isTouchCancelled())
        return;
    logTap(L"Tap Canvas Button");
    if (m_menu->isVisible()) {
        m_menu->hide();
        return;
    }
    m_menuItem = -1;
    const QPoint corner(m_canvas.button->x() - 7, m_canvas.button->y() + TOOLBARBTN_SIZE.height() - 9);
    m_menu->popup(mapToGlobal(corner));
}

void ToolsBar::hideCanvasMenu()
{
    m_menu->hide();
}

void ToolsBar::canvasBtnSelected()
{
    m_outsidePress->start();
    m_canvas.button->changeButtonState(KSPushbutton::ButtonSelectedRest);
    Q_EMIT signalShowCanvasMenu(true);
}

void ToolsBar::canvasBtnReleased()
{
    m_outsidePress->stop();
    m_canvas.button->changeButtonState(KSPushbutton::ButtonRest);
    Q_EMIT signalShowCanvasMenu(false);
}

bool ToolsBar::eventFilter(QObject* obj, QEvent* event)
{
    return obj == m_menu && paintCanvasMenu(event);
}

bool ToolsBar::paintCanvasMenu(QEvent* event)
{
    switch (event->type()) {
    case QEvent::MouseButtonPress:
        onMouseButtonPress(static_cast<QMouseEvent*>(event));
        return true;
    case QEvent::MouseButtonRelease:
        onMouseButtonRelease(static_cast<QMouseEvent*>(event));
        return true;
    case QEvent::MouseMove:
        onMouseButtonMove(static_cast<QMouseEvent*>(event));
        return true;
    case QEvent::Leave:
        onMouseLeave();
        return true;
    case QEvent::Resize: {
        DrawBoundingRectangle background;
        m_menuBackground = background.paintBoundingRectangle(MENU_BACKGROUND_KIND);
        m_menu->setMask(m_menuBackground.mask()); // otherwise the corners are black without a compositor
        return false;
    }
    case QEvent::Paint: {
        QPainter painter(m_menu);
        painter.drawPixmap(0, 0, m_menuBackground);
        drawMenuItem(&painter);
        return true;
    }
    default:
        return false;
    }
}

void ToolsBar::onMouseButtonPress(QMouseEvent* event)
{
    m_menuItem = cursorItem(event->position().toPoint());
    m_menu->update();
}

void ToolsBar::onMouseButtonRelease(QMouseEvent* event)
{
    const int item = cursorItem(event->position().toPoint());
    m_menuItem = -1;
    if (item < 0) {
        m_menu->update();
        return;
    }
    QAction* action = m_menu->actions().at(item);
    m_menu->hide();
    Q_EMIT menuTriggered(action);
}

void ToolsBar::onMouseButtonMove(QMouseEvent* event)
{
    const int item = cursorItem(event->position().toPoint());
    if (item != m_menuItem) {
        m_menuItem = item;
        m_menu->update();
    }
}

void ToolsBar::onMouseLeave()
{
    m_menuItem = -1;
    if (m_menu->isVisible())
        m_menu->update();
}

QRect ToolsBar::getMenuItemRect(const QRect& rect, int index)
{
    constexpr int SIDE = 9;
    constexpr int TOP = 11;
    constexpr int STEP = 64;
    constexpr int HEIGHT = 60;
    return QRect(rect.left() + SIDE, rect.top() + TOP + STEP * index, rect.width() - 2 * SIDE, HEIGHT);
}

int ToolsBar::cursorItem(const QPoint& point) const
{
    for (int i = 0; i < MENU_ITEMS; ++i)
        if (getMenuItemRect(m_menu->rect(), i).contains(point))
            return i;
    return -1;
}

void ToolsBar::drawMenuItem(QPainter* painter)
{
    QFont font = m_menu->font();
    font.setPixelSize(24);
    painter->setFont(font);
    painter->setPen(Qt::white);
    const QList<QAction*> actions = m_menu->actions();
    for (int i = 0; i < MENU_ITEMS; ++i) {
        const QRect area = getMenuItemRect(m_menu->rect(), i);
        if (i == m_menuItem)
            painter->drawPixmap(area, m_menuCursor);
        if (i > 0) {
            painter->drawPixmap(QRect(area.left(), area.top() - m_menuSeparator.height(), area.width(),
                                      m_menuSeparator.height()),
                                m_menuSeparator);
        }
        painter->drawText(area.adjusted(MENU_TEXT_INDENT, 0, 0, 0), Qt::AlignLeft | Qt::AlignVCenter,
                          actions.at(i)->text());
    }
}
