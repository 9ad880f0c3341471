#include "resources/artwork/DesignTokens.h"
#include "resources/artwork/Families.h"
#include "resources/artwork/Icons.h"

#include <QLinearGradient>
#include <QPainter>
#include <QPolygonF>

#include <cmath>

namespace
{

const QSize MARK(36, 36); // of a finger's size around the drawing
const QSize SIGN(28, 28);
const QSize ARROW(20, 20);

enum class State { Rest, Pressed, Disabled };
enum class Check { On, Off, Partial };

struct StateName {
    State state;
    const char* name;
};

constexpr StateName STATES[] = {
    {State::Rest, "Rest"}, {State::Pressed, "Pressed"}, {State::Disabled, "Disabled"}};

// Sets pen and brush of the box or ring that holds a mark.
void setHolder(QPainter& painter, const QRectF& box, State state, bool isOn)
{
    painter.setRenderHint(QPainter::Antialiasing);
    QLinearGradient fill(box.topLeft(), box.bottomLeft());
    QColor line = isOn ? Tokens::ACCENT : Tokens::TEXT;
    if (state == State::Disabled) {
        fill.setColorAt(0, isOn ? Tokens::SELECTED_DISABLED : Tokens::FACE_DISABLED);
        line = Tokens::TEXT_DISABLED;
    } else if (state == State::Pressed) {
        fill.setColorAt(0, isOn ? Tokens::SELECTED_PRESSED_TOP : Tokens::FACE_PRESSED_TOP);
        fill.setColorAt(1, isOn ? Tokens::SELECTED_PRESSED_BOTTOM : Tokens::FACE_PRESSED_BOTTOM);
        line = Tokens::ACCENT_LIGHT;
    } else {
        fill.setColorAt(0, isOn ? Tokens::SELECTED_TOP : Tokens::WELL);
        fill.setColorAt(1, isOn ? Tokens::SELECTED_BOTTOM : Tokens::WELL);
    }
    painter.setPen(QPen(line, Tokens::STROKE));
    painter.setBrush(fill);
}

QColor markColor(State state)
{
    return state == State::Disabled ? Tokens::TEXT_DISABLED : Tokens::TEXT_SELECTED;
}

void checkBox(QPainter& painter, Check check, State state)
{
    const QRectF box(6, 6, 24, 24);
    setHolder(painter, box, state, check != Check::Off);
    painter.drawRoundedRect(box, Tokens::RADIUS_BUTTON, Tokens::RADIUS_BUTTON);
    if (check == Check::On) {
        QPen pen = Icons::linePen(markColor(state));
        pen.setWidthF(Tokens::STROKE * 1.5); // a mark is read from farther than an icon
        painter.setPen(pen);
        painter.setBrush(Qt::NoBrush);
        painter.drawPolyline(QPolygonF({QPointF(11, 18.5), QPointF(16, 23.5), QPointF(25, 12.5)}));
    } else if (check == Check::Partial) {
        painter.fillRect(QRectF(11, 16, 14, 4), markColor(state));
    }
}

void radioButton(QPainter& painter, bool isOn, State state)
{
    const QRectF ring(6, 6, 24, 24);
    setHolder(painter, ring, state, isOn);
    painter.drawEllipse(ring);
    if (isOn) {
        painter.setPen(Qt::NoPen);
        painter.setBrush(markColor(state));
        painter.drawEllipse(QPointF(18, 18), 6, 6);
    }
}

// Opens or closes a row of a tree.
void treeSign(QPainter& painter, bool isOpen, State state)
{
    painter.setRenderHint(QPainter::Antialiasing);
    if (state == State::Pressed) {
        painter.setPen(QPen(Tokens::ACCENT, Tokens::BORDER_PRESSED));
        painter.setBrush(Tokens::FACE_PRESSED_TOP);
        painter.drawRoundedRect(QRectF(3, 3, 30, 30), Tokens::RADIUS_BUTTON, Tokens::RADIUS_BUTTON);
    }
    const QColor color = state == State::Disabled  ? Tokens::TEXT_DISABLED
                         : state == State::Pressed ? Tokens::TEXT_SELECTED
                                                   : Tokens::TEXT;
    Icons::begin(painter, color);
    painter.setBrush(color);
    painter.drawPolygon(isOpen ? QPolygonF({QPointF(8, 13), QPointF(28, 13), QPointF(18, 25)})
                               : QPolygonF({QPointF(13, 8), QPointF(25, 18), QPointF(13, 28)}));
}

void recordingSign(QPainter& painter)
{
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(QPen(Tokens::TEXT, Tokens::STROKE));
    painter.setBrush(Tokens::RECORDING);
    painter.drawEllipse(QRectF(4, 4, 20, 20));
}

// Eight dots in a ring; the brightest is the step's, those it has left behind fade.
void loadingSign(QPainter& painter, int step)
{
    constexpr int DOTS = 8;
    constexpr qreal PI = 3.14159265358979323846;
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(Qt::NoPen);
    for (int dot = 0; dot < DOTS; ++dot) {
        const int age = (step - dot + DOTS) % DOTS;
        QColor color = Tokens::TEXT;
        color.setAlphaF(1.0F - 0.8F * float(age) / float(DOTS - 1));
        painter.setBrush(color);
        const qreal angle = 2 * PI * dot / DOTS;
        painter.drawEllipse(QPointF(14 + 10 * std::sin(angle), 14 - 10 * std::cos(angle)), 2.8, 2.8);
    }
}

void headerArrow(QPainter& painter, bool isUp)
{
    painter.setRenderHint(QPainter::Antialiasing);
    Icons::begin(painter, Tokens::TEXT);
    if (isUp) {
        painter.drawPolyline(QPolygonF({QPointF(4, 13), QPointF(10, 7), QPointF(16, 13)}));
    } else {
        painter.drawPolyline(QPolygonF({QPointF(4, 7), QPointF(10, 13), QPointF(16, 7)}));
    }
}

void addCheckBoxes(QList<Picture>& table)
{
    const struct {
        Check check;
        const char* name;
    } checks[] = {{Check::On, "On"}, {Check::Off, "Off"}, {Check::Partial, "Partial"}};
    for (const auto& row : checks) {
        for (const StateName& state : STATES) {
            table.append(sizedPicture(WIDGET_COLLECTION,
                                      QStringLiteral("CheckBox/Checkbox_%1_%2")
                                          .arg(QLatin1String(row.name), QLatin1String(state.name)),
                                      MARK,
                                      [check = row.check, of = state.state](QPainter& painter, const QSize&) {
                                          checkBox(painter, check, of);
                                      }));
        }
    }
}

// The tools' radio buttons and the library's look alike.
void addRadioButtons(QList<Picture>& table)
{
    const struct {
        QString collection;
        const char* folder;
    } places[] = {{TOOL_COLLECTION, "RadioButton"}, {WIDGET_COLLECTION, "KSRadioButton"}};
    for (const auto& place : places) {
        for (const bool isOn : {true, false}) {
            for (const StateName& state : STATES) {
                table.append(sizedPicture(place.collection,
                                          QStringLiteral("%1/Radiobutton_%2_%3")
                                              .arg(QLatin1String(place.folder),
                                                   isOn ? QStringLiteral("On") : QStringLiteral("Off"),
                                                   QLatin1String(state.name)),
                                          MARK, [isOn, of = state.state](QPainter& painter, const QSize&) {
                                              radioButton(painter, isOn, of);
                                          }));
            }
        }
    }
}

void addTreeSigns(QList<Picture>& table)
{
    for (const bool isOpen : {false, true}) {
        for (const StateName& state : STATES) {
            table.append(sizedPicture(
                WIDGET_COLLECTION,
                QStringLiteral("Views/Parts_%1_%2")
                    .arg(isOpen ? QStringLiteral("012") : QStringLiteral("011"), QLatin1String(state.name)),
                MARK, [isOpen, of = state.state](QPainter& painter, const QSize&) {
                    treeSign(painter, isOpen, of);
                }));
        }
    }
    table.append(sizedPicture(WIDGET_COLLECTION, QStringLiteral("Views/Recording_Icon"), SIGN,
                              [](QPainter& painter, const QSize&) { recordingSign(painter); }));
    constexpr int STEPS = 8;
    for (int step = 0; step < STEPS; ++step) {
        table.append(sizedPicture(WIDGET_COLLECTION, QStringLiteral("Views/Loading_Icon-0%1").arg(step + 1),
                                  SIGN,
                                  [step](QPainter& painter, const QSize&) { loadingSign(painter, step); }));
    }
    for (const bool isUp : {true, false}) {
        table.append(sizedPicture(WIDGET_COLLECTION,
                                  isUp ? QStringLiteral("Picker/Picker_Allow_Up_Rest")
                                       : QStringLiteral("Picker/Picker_Allow_Dn_Rest"),
                                  ARROW,
                                  [isUp](QPainter& painter, const QSize&) { headerArrow(painter, isUp); }));
    }
}

} // namespace

void Families::addMarks(QList<Picture>& table)
{
    addCheckBoxes(table);
    addRadioButtons(table);
    addTreeSigns(table);
}
