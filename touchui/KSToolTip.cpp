#include "touchui/KSToolTip.h"

#include "touchui/BalloonPainter.h"
#include "touchui/BalloonWindow.h"

#include <QApplication>
#include <QFontMetrics>
#include <QPainter>

namespace
{

constexpr int TEXT_PIXELS = 24;
constexpr int MARGIN_X = 16;
constexpr int MARGIN_Y = 8;
constexpr int LEAST_WIDTH = 56;
const QColor TEXT_COLOR(220, 220, 220);

} // namespace

QWidget* KSToolTip::s_mainWindow = nullptr;
KSToolTip* KSToolTip::s_KsToolTip = nullptr;
QString KSToolTip::s_LongText;
QPolygon KSToolTip::s_points;

KSToolTip::KSToolTip()
    : m_frame(BalloonPainter::frame())
    , m_arrowUp(BalloonPainter::arrowUp())
    , m_arrowDown(BalloonPainter::arrowDown())
{
}

KSToolTip::~KSToolTip()
{
    delete m_window;
}

KSToolTip* KSToolTip::getInstance()
{
    if (s_KsToolTip == nullptr) {
        s_KsToolTip = new KSToolTip;
        // The window of the balloon must be destroyed before the application.
        connect(qApp, &QCoreApplication::aboutToQuit, s_KsToolTip, &KSToolTip::clearInstance);
    }
    return s_KsToolTip;
}

void KSToolTip::clearInstance()
{
    delete s_KsToolTip;
    s_KsToolTip = nullptr;
    s_LongText.clear();
}

void KSToolTip::showText(const QRect& anchor, const QString& text)
{
    getInstance()->show(anchor, text, false);
}

void KSToolTip::showTextForSlider(const QRect& handle, const QString& text)
{
    getInstance()->show(handle, text, false);
}

void KSToolTip::showTextForTreeView(const QRect& row, const QString& text, int shownWidth)
{
    if (shownWidth > 0 && QFontMetrics(textFont()).horizontalAdvance(text) <= shownWidth) {
        hideText();
        return;
    }
    getInstance()->show(row, text, true);
}

void KSToolTip::hideText()
{
    if (s_KsToolTip != nullptr && s_KsToolTip->m_window != nullptr)
        s_KsToolTip->m_window->hide();
    s_LongText.clear();
}

QFont KSToolTip::textFont()
{
    QFont font = QApplication::font();
    font.setPixelSize(TEXT_PIXELS);
    return font;
}

void KSToolTip::show(const QRect& anchor, const QString& text, bool below)
{
    if (text.isEmpty()) {
        hideText();
        return;
    }
    s_LongText = text;
    const QRect bounds = BalloonWindow::bounds(s_mainWindow, anchor.center());
    const QString shown = changeTextLength(text, bounds.width() - 2 * MARGIN_X);
    const QSize size = calculateTextRect(shown).size() + QSize(0, MenuPlacement::ARROW_LENGTH);
    const MenuPlacement::Placement placement = adjustToolTipPostion(anchor, size, below);
    QPixmap picture(size);
    picture.fill(Qt::transparent);
    {
        QPainter painter(&picture);
        const QRect body = MenuPlacement::background(size, placement.side);
        if (placement.side == MenuPlacement::ArrowSide::Top)
            paintTop(painter, body, shown);
        else
            paintBottom(painter, body, shown);
    }
    if (m_window == nullptr || m_window->parentWidget() != s_mainWindow) {
        delete m_window;
        m_window = new BalloonWindow(s_mainWindow);
        m_window->setObjectName(QStringLiteral("KSToolTip"));
    }
    m_window->showPicture(picture, placement.rect.topLeft());
}

QRect KSToolTip::calculateTextRect(const QString& text) const
{
    const QFontMetrics metrics(textFont());
    return QRect(0, 0, qMax(LEAST_WIDTH, metrics.horizontalAdvance(text) + 2 * MARGIN_X),
                 metrics.height() + 2 * MARGIN_Y);
}

QString KSToolTip::changeTextLength(const QString& text, int width) const
{
    QString line = text;
    line.replace(QLatin1Char('\n'), QLatin1Char(' '));
    return QFontMetrics(textFont()).elidedText(line, Qt::ElideRight, width);
}

MenuPlacement::Placement KSToolTip::adjustToolTipPostion(const QRect& anchor, const QSize& size, bool below)
{
    const QRect bounds = BalloonWindow::bounds(s_mainWindow, anchor.center());
    const MenuPlacement::Placement placement = MenuPlacement::placeBalloon(anchor, size, bounds, below);
    m_arrowPoint = placement.tip;
    const int base = placement.side == MenuPlacement::ArrowSide::Top ? MenuPlacement::ARROW_LENGTH
                                                                     : -MenuPlacement::ARROW_LENGTH;
    const QPoint half(MenuPlacement::ARROW_WIDTH / 2, 0);
    s_points = QPolygon(
        {m_arrowPoint, m_arrowPoint + QPoint(0, base) - half, m_arrowPoint + QPoint(0, base) + half});
    return placement;
}

void KSToolTip::paintTop(QPainter& painter, const QRect& rect, const QString& text) const
{
    BalloonPainter::paintBand(painter, m_frame, rect, 0, m_arrowUp, m_arrowPoint.x());
    BalloonPainter::paintBand(painter, m_frame, rect, 1);
    BalloonPainter::paintBand(painter, m_frame, rect, 2);
    drawText(painter, rect, text);
}

void KSToolTip::paintBottom(QPainter& painter, const QRect& rect, const QString& text) const
{
    BalloonPainter::paintBand(painter, m_frame, rect, 0);
    BalloonPainter::paintBand(painter, m_frame, rect, 1);
    BalloonPainter::paintBand(painter, m_frame, rect, 2, m_arrowDown, m_arrowPoint.x());
    drawText(painter, rect, text);
}

void KSToolTip::drawText(QPainter& painter, const QRect& body, const QString& text) const
{
    painter.setFont(textFont());
    painter.setPen(TEXT_COLOR);
    painter.drawText(body, Qt::AlignCenter | Qt::TextSingleLine, text);
}
