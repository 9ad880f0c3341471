#include "panel/ColorPalette.h"

#include "canvas/DrawBoundingRectangle.h"
#include "panel/ColorButton.h"
#include "panel/ToolBox.h"
#include "touchui/FlickMotion.h"
#include "touchui/KSInputContext.h"
#include "touchui/WindowPlaceKeeper.h"

#include <QGridLayout>
#include <QHBoxLayout>
#include <QLabel>
#include <QMouseEvent>
#include <QPainter>
#include <QVBoxLayout>

const QString ColorPalette::PALETTE_LABEL_STYLE = QStringLiteral("color:rgb(220, 220, 220); font-size:24px;");

namespace
{

constexpr int BACKGROUND_KIND = 4;
constexpr QSize COLOR_BUTTON_SIZE(53, 48);
constexpr int HORIZONTAL_SPACING = 8;
constexpr int VERTICAL_SPACING = 30;
constexpr int TITLE_TOP = 11;
constexpr int TITLE_LEFT = 19;
constexpr int GRID_TOP = 56;
constexpr int ANSWERS_TOP = 275;
constexpr int ANSWER_SPACING = 20;
constexpr QColor FOCUS_COLOR(0, 129, 255);
constexpr QColor CORNER_COLOR(30, 30, 30); // outside the round corners of the frame
constexpr int FOCUS_MARGIN = 3;

const char REST_STYLE[] = "border: 1px solid white; width:53px; height:48px;border-radius:2px;";
const char CURRENT_STYLE[] = "border: 2px solid blue; width:51px; height:46px;border-radius:3px;";

} // namespace

ColorPalette::ColorPalette(QWidget* parent) : QDialog(parent, Qt::Dialog | Qt::FramelessWindowHint)
{
    setObjectName(QStringLiteral("ColorPalette"));
    setFixedSize(PALETTE_WIDTH, PALETTE_HEIGHT);
    setAttribute(Qt::WA_AcceptTouchEvents);
    connect(&m_finger, &OneFinger::began, this, [this] {
        m_placeAtPress = pos();
        startDrag(m_finger.positionIn(this).toPoint(), m_finger.position().toPoint());
    });
    connect(&m_finger, &OneFinger::moved, this, [this] { drag(m_finger.position().toPoint()); });
    connect(&m_finger, &OneFinger::lifted, this, [this] { m_pressedObjectName.clear(); });
    connect(&m_finger, &OneFinger::cancelled, this, &ColorPalette::putBack);
    new WindowPlaceKeeper(this); // owned by this widget
    initColorValueList();
    createButtons();
    createLayout();
    translateText();
}

void ColorPalette::initColorValueList()
{
    static const char* const COLORS[ROW_COUNT * CULUMN_COUNT] = {
        "#FFFFFF", "#C6C6C6", "#717171", "#393939", "#000000", "#D2E9F7", "#FFFDA8", "#7489B3",
        "#8D9786", "#273F69", "#C80000", "#FF8000", "#FFF700", "#95ED07", "#00C743", "#51DDE6",
        "#2987F2", "#0D5EFF", "#9410E6", "#F250B2", "#610707", "#916C0F", "#D6D4A9", "#1D470D",
        "#BEEBC0", "#187D85", "#0B2159", "#C8BBED", "#8E6580", "#FFC4FD"};
    for (const char* color : COLORS)
        m_colors.append(QString::fromLatin1(color));
}

void ColorPalette::createButtons()
{
    for (int i = 0; i < m_colors.size(); ++i) {
        auto* button = new ColorButton(this);
        button->setFixedSize(COLOR_BUTTON_SIZE);
        m_buttons.append(button);
        styleButton(i);
        connect(button, &QAbstractButton::pressed, this, [this, i] { colorButtonPressed(i); });
        connect(button, &QAbstractButton::released, this, [this, i] { colorButtonReleased(i); });
        connect(button, &QAbstractButton::clicked, this, [this, i] { setColorValue(i); });
    }
    for (KSPushbutton** answer : {&m_ok, &m_cancel}) {
        *answer = new KSPushbutton(ToolBox::buttonImages(true, true), this);
        (*answer)->setFixedSize(OK_CANCEL_WIDTH, OK_CANCEL_HEIGHT);
        (*answer)->setFocusPolicy(Qt::NoFocus);
        (*answer)->setStyleSheet(PALETTE_LABEL_STYLE);
        ToolBox::connectLooks(*answer);
    }
    m_ok->setObjectName(QStringLiteral("PaletteOK"));
    m_cancel->setObjectName(QStringLiteral("PaletteCancel"));
    connect(m_ok, &QAbstractButton::clicked, this, &ColorPalette::okClicked);
    connect(m_cancel, &QAbstractButton::clicked, this, &ColorPalette::cancelClicked);
}

void ColorPalette::createLayout()
{
    m_title = new QLabel(this);
    m_title->setStyleSheet(PALETTE_LABEL_STYLE);
    // The palette can also be dragged by its title.
    m_title->setAttribute(Qt::WA_TransparentForMouseEvents);
    m_title->setGeometry(TITLE_LEFT, TITLE_TOP, PALETTE_LABEL_WIDTH, PALETTE_LABEL_HEIGHT);

    auto* grid = new QGridLayout;
    grid->setContentsMargins(0, 0, 0, 0);
    grid->setHorizontalSpacing(HORIZONTAL_SPACING);
    grid->setVerticalSpacing(VERTICAL_SPACING);
    for (int i = 0; i < m_buttons.size(); ++i)
        grid->addWidget(m_buttons.at(i), i / CULUMN_COUNT, i % CULUMN_COUNT);
    auto* gridRow = new QHBoxLayout;
    gridRow->addStretch();
    gridRow->addLayout(grid);
    gridRow->addStretch();

    auto* answers = new QHBoxLayout;
    answers->addStretch();
    answers->addWidget(m_ok);
    answers->addSpacing(ANSWER_SPACING);
    answers->addWidget(m_cancel);
    answers->addStretch();

    const int gridHeight = ROW_COUNT * COLOR_BUTTON_SIZE.height() + (ROW_COUNT - 1) * VERTICAL_SPACING;
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(0);
    column->addSpacing(GRID_TOP);
    column->addLayout(gridRow);
    column->addSpacing(ANSWERS_TOP - GRID_TOP - gridHeight);
    column->addLayout(answers);
    column->addStretch();
}

void ColorPalette::translateText()
{
    m_title->setText(tr("Color Palette"));
    m_ok->setText(tr("OK"));
    m_cancel->setText(tr("Cancel"));
}

// Selection

void ColorPalette::setCurrentColor(const QString& color)
{
    select(int(m_colors.indexOf(color.toUpper())));
    m_currentColor = color;
    m_colorAtOpen = color;
}

void ColorPalette::select(int index)
{
    const int previous = std::exchange(m_currentIndex, index);
    for (const int changed : {previous, index}) {
        if (changed >= 0) {
            m_buttons.at(changed)->changeButtonState(changed == index ? KSPushbutton::ButtonSelectedRest
                                                                      : KSPushbutton::ButtonRest);
            styleButton(changed);
        }
    }
    update();
}

void ColorPalette::styleButton(int index)
{
    m_buttons.at(index)->setFace(m_colors.at(index),
                                 QString::fromLatin1(index == m_currentIndex ? CURRENT_STYLE : REST_STYLE));
}

void ColorPalette::colorButtonPressed(int index)
{
    m_buttons.at(index)->changeButtonState(index == m_currentIndex ? KSPushbutton::ButtonSelectedPressed
                                                                   : KSPushbutton::ButtonPressed);
}

void ColorPalette::colorButtonReleased(int index)
{
    m_buttons.at(index)->changeButtonState(index == m_currentIndex ? KSPushbutton::ButtonSelectedRest
                                                                   : KSPushbutton::ButtonRest);
}

void ColorPalette::setColorValue(int index)
{
    select(index);
    m_currentColor = m_colors.at(index);
    Q_EMIT sendColorValue(m_currentColor, PREVIEW);
}

void ColorPalette::okClicked()
{
    closePalette();
    Q_EMIT sendColorValue(m_currentColor, OK);
}

void ColorPalette::cancelClicked()
{
    closePalette();
    Q_EMIT sendColorValue(m_colorAtOpen, CANCEL);
}

void ColorPalette::reject()
{
    if (isVisible())
        cancelClicked();
}

void ColorPalette::closePalette()
{
    hide();
    if (KSInputContext* input = KSInputContext::instance())
        input->hideMaskOnSoftKeyboard();
}

// Painting

void ColorPalette::resizeEvent(QResizeEvent* event)
{
    m_separator = QPixmap(QStringLiteral(":/Separator_H"));
    m_background = DrawBoundingRectangle().paintBoundingRectangle(BACKGROUND_KIND);
    QDialog::resizeEvent(event);
}

void ColorPalette::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    painter.setRenderHint(QPainter::SmoothPixmapTransform);
    painter.fillRect(rect(), CORNER_COLOR);
    painter.drawPixmap(rect(), m_background);
    drawHorizontalLine(painter, TOPLINE_RECT);
    drawHorizontalLine(painter, BOTTOMLINE_RECT);
    drawFocusBoundingRect(painter);
}

void ColorPalette::drawHorizontalLine(QPainter& painter, const QRect& line) const
{
    painter.drawPixmap(line, m_separator);
}

void ColorPalette::drawFocusBoundingRect(QPainter& painter) const
{
    if (m_currentIndex < 0)
        return;
    const QRect frame = m_buttons.at(m_currentIndex)
                            ->geometry()
                            .adjusted(-FOCUS_MARGIN, -FOCUS_MARGIN, FOCUS_MARGIN, FOCUS_MARGIN);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(Qt::NoPen);
    painter.setBrush(FOCUS_COLOR);
    painter.drawRoundedRect(frame, FOCUS_MARGIN + 1, FOCUS_MARGIN + 1);
}

// Moving

// Handles a finger on the palette like a mouse; the buttons handle their own touches.
bool ColorPalette::event(QEvent* event)
{
    if (!OneFinger::isTouch(event))
        return QDialog::event(event);
    event->accept();
    return m_finger.takes(event);
}

void ColorPalette::putBack()
{
    m_pressedObjectName.clear();
    move(m_placeAtPress);
}

void ColorPalette::mousePressEvent(QMouseEvent* event)
{
    startDrag(event->position().toPoint(), event->globalPosition().toPoint());
}

void ColorPalette::mouseMoveEvent(QMouseEvent* event)
{
    drag(event->globalPosition().toPoint());
}

void ColorPalette::mouseReleaseEvent(QMouseEvent*)
{
    m_pressedObjectName.clear();
}

void ColorPalette::startDrag(const QPoint& local, const QPoint& global)
{
    const QWidget* child = childAt(local);
    m_pressedObjectName = child ? child->objectName() : objectName();
    m_dragOrigin = global - pos();
}

void ColorPalette::drag(const QPoint& global)
{
    if (m_pressedObjectName == objectName())
        move(FlickMotion::slideInside(global - m_dragOrigin, pos(), m_titlerWindowRect, size()));
}

// Masks

void ColorPalette::showDialogMask(bool show)
{
    m_masks.showDialogMaskWidget(show);
}

void ColorPalette::showMessageMask(bool show)
{
    m_masks.showMessageMaskWidget(show);
}
