#include "resources/artwork/DesignTokens.h"
#include "resources/artwork/Families.h"
#include "resources/artwork/Icons.h"
#include "resources/artwork/Surfaces.h"

#include <QPainter>

namespace
{

constexpr int BAR = 32; // thickness of a scroll bar
constexpr int BAR_CAP = 12;
constexpr int GRIP = 14; // length of the piece with the lines a finger grips
constexpr int STRETCH = 8;
constexpr int TRACK_INSET = 4;
constexpr int HANDLE_INSET = 3;

void track(QPainter& painter, const QSize& size)
{
    const int width = size.width() - 2 * TRACK_INSET;
    painter.fillRect(TRACK_INSET, 0, width, size.height(), Tokens::TRACK);
    painter.fillRect(TRACK_INSET, 0, 1, size.height(), Tokens::OUTLINE);
    painter.fillRect(TRACK_INSET + width - 1, 0, 1, size.height(), Tokens::GROOVE_LIGHT);
}

void trackAcross(QPainter& painter, const QSize& size)
{
    const int height = size.height() - 2 * TRACK_INSET;
    painter.fillRect(0, TRACK_INSET, size.width(), height, Tokens::TRACK);
    painter.fillRect(0, TRACK_INSET, size.width(), 1, Tokens::OUTLINE);
    painter.fillRect(0, TRACK_INSET + height - 1, size.width(), 1, Tokens::GROOVE_LIGHT);
}

// Flat along the track, so that it can be as long as it must.
void handle(QPainter& painter, const QSize& size, bool isVertical, bool pressed)
{
    const int x = isVertical ? HANDLE_INSET : 0;
    const int y = isVertical ? 0 : HANDLE_INSET;
    painter.translate(x, y);
    const QColor& face = pressed ? Tokens::SELECTED_TOP : Tokens::HANDLE;
    Surfaces::drawFace(painter, size - QSize(2 * x, 2 * y),
                       {face, face, pressed ? Tokens::ACCENT_LIGHT : Tokens::OUTLINE,
                        pressed ? QColor() : Tokens::HANDLE_LIGHT,
                        pressed ? Tokens::BORDER_PRESSED : Tokens::BORDER},
                       Tokens::RADIUS_PANE);
}

// The middle of a handle, between whose ends it fits, with three lines across.
void grip(QPainter& painter, const QSize& size, bool isVertical, bool pressed)
{
    const QSize whole = isVertical ? QSize(size.width(), size.height() + 2 * BAR_CAP)
                                   : QSize(size.width() + 2 * BAR_CAP, size.height());
    painter.save();
    painter.translate(isVertical ? 0 : -BAR_CAP, isVertical ? -BAR_CAP : 0);
    handle(painter, whole, isVertical, pressed);
    painter.restore();
    const QColor& color = pressed ? Tokens::TEXT_SELECTED : Tokens::HANDLE_GRIP;
    constexpr int INSET = 9;
    for (int at = 0; at < GRIP; at += 6) {
        if (isVertical) {
            painter.fillRect(INSET, at, size.width() - 2 * INSET, int(Tokens::STROKE), color);
        } else {
            painter.fillRect(at, INSET, int(Tokens::STROKE), size.height() - 2 * INSET, color);
        }
    }
}

void addScrollBars(QList<Picture>& table)
{
    const QString folder = QStringLiteral("Scrollbar/");
    table.append(
        sizedPicture(WIDGET_COLLECTION, folder + QStringLiteral("Scbar_base_v"), QSize(BAR, STRETCH), track));
    table.append(sizedPicture(WIDGET_COLLECTION, folder + QStringLiteral("Scbar_base_h"), QSize(STRETCH, BAR),
                              trackAcross));
    // Behind the handle of a list that is shown whole, and on the handle of one that scrolls.
    table.append(sizedPicture(WIDGET_COLLECTION, QStringLiteral("back"), QSize(20, STRETCH), track));
    table.append(
        sizedPicture(WIDGET_COLLECTION, QStringLiteral("control"), QSize(14, GRIP),
                     [](QPainter& painter, const QSize& size) { handle(painter, size, true, false); }));
    for (const bool pressed : {false, true}) {
        const QString state = pressed ? QStringLiteral("pressed_") : QStringLiteral("rest_");
        const QString down = folder + QStringLiteral("Scbar_handle_v_") + state;
        addThreeSliceDown(table, WIDGET_COLLECTION,
                          {down + QStringLiteral("upper"), down + QStringLiteral("center"),
                           down + QStringLiteral("bottom")},
                          BAR, BAR_CAP, [pressed](QPainter& painter, const QSize& size) {
                              handle(painter, size, true, pressed);
                          });
        table.append(sizedPicture(
            WIDGET_COLLECTION, down + QStringLiteral("center_interval"), QSize(BAR, GRIP),
            [pressed](QPainter& painter, const QSize& size) { grip(painter, size, true, pressed); }));
        const QString across = folder + QStringLiteral("Scbar_handle_h_") + state;
        addThreeSlice(table, WIDGET_COLLECTION,
                      {across + QStringLiteral("left"), across + QStringLiteral("center"),
                       across + QStringLiteral("right")},
                      BAR, BAR_CAP, [pressed](QPainter& painter, const QSize& size) {
                          handle(painter, size, false, pressed);
                      });
        table.append(sizedPicture(
            WIDGET_COLLECTION, across + QStringLiteral("center_interval"), QSize(GRIP, BAR),
            [pressed](QPainter& painter, const QSize& size) { grip(painter, size, false, pressed); }));
    }
}

void sliderHandle(QPainter& painter, const QSize& size, bool pressed)
{
    Surfaces::drawFace(painter, size,
                       pressed ? Surfaces::Face{Tokens::SELECTED_TOP, Tokens::SELECTED_BOTTOM,
                                                Tokens::ACCENT_LIGHT, QColor(), Tokens::BORDER_PRESSED}
                               : Surfaces::Face{Tokens::HANDLE_TOP, Tokens::HANDLE_BOTTOM, Tokens::OUTLINE,
                                                Tokens::TEXT, Tokens::BORDER},
                       Tokens::RADIUS_BUTTON);
    const int middle = size.width() / 2;
    constexpr int INSET = 8;
    painter.fillRect(middle - 1, INSET, int(Tokens::STROKE), size.height() - 2 * INSET,
                     pressed ? Tokens::TEXT_SELECTED : Tokens::HANDLE_GRIP);
}

void sliderGroove(QPainter& painter, const QSize& size)
{
    Surfaces::drawFace(painter, size,
                       {Tokens::WELL, Tokens::WELL, Tokens::EDGE_LIGHT, Tokens::WELL_SHADE, Tokens::BORDER},
                       size.height() / 2.0 - 1);
}

void addSlider(QList<Picture>& table)
{
    const QString folder = QStringLiteral("Slider/");
    for (const bool pressed : {false, true}) {
        table.append(sizedPicture(WIDGET_COLLECTION,
                                  folder + (pressed ? QStringLiteral("Slider_S_Handle_Pressed")
                                                    : QStringLiteral("Slider_S_Handle_Rest")),
                                  QSize(30, 36), [pressed](QPainter& painter, const QSize& size) {
                                      sliderHandle(painter, size, pressed);
                                  }));
    }
    addThreeSlice(table, WIDGET_COLLECTION,
                  {folder + QStringLiteral("Slider_H_S_Left"), folder + QStringLiteral("Slider_H_S_Center"),
                   folder + QStringLiteral("Slider_H_S_Right")},
                  12, 8, sliderGroove);
}

// What lies under an item that is lifted off its list.
void liftedPlate(QPainter& painter, const QSize& size)
{
    Surfaces::drawFace(
        painter, size,
        {Tokens::LIFTED_TOP, Tokens::LIFTED_BOTTOM, Tokens::ACCENT, QColor(), Tokens::BORDER_PRESSED},
        Tokens::RADIUS_PANE);
}

void moveHandle(QPainter& painter, const QSize& size)
{
    Icons::begin(painter, Tokens::TEXT);
    for (const int y : {4, 11, 18}) {
        painter.drawLine(QPointF(2, y), QPointF(size.width() - 2, y));
    }
}

void addDragged(QList<Picture>& table)
{
    const QString folder = QStringLiteral("MainButtons/Main_");
    table.append(
        sizedPicture(WIDGET_COLLECTION, folder + QStringLiteral("Move_Handle"), QSize(22, 22), moveHandle));
    addThreeSlice(table, WIDGET_COLLECTION,
                  {folder + QStringLiteral("drag_base_Left"), folder + QStringLiteral("drag_base_Center"),
                   folder + QStringLiteral("drag_base_Right")},
                  139, 12, liftedPlate);
}

} // namespace

void Families::addTracks(QList<Picture>& table)
{
    addScrollBars(table);
    addSlider(table);
    addDragged(table);
}
