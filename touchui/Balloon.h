#pragma once

#include "touchui/MenuPlacement.h"
#include "touchui/SliceFrame.h"

#include <QFont>
#include <QObject>
#include <QPointer>
#include <QRect>
#include <QString>

class BalloonWindow;
class QPainter;
class QTimer;
class QWidget;

// A balloon of its own by a widget: what a button does, under it, or a prompt above what it is about. It goes
// by hide(), with the widget, or after its time. GUI thread only.
class Balloon : public QObject
{
    Q_OBJECT
public:
    explicit Balloon(QObject* parent = nullptr);
    ~Balloon() override;

    static constexpr int FONT_SIZE = 29; // pixels
    // Bounds the balloons and owns their windows; null: the screen does.
    static QWidget* s_ParentWindow;

    // One line under the button, arrow up; above it where there is no room. An empty text hides the balloon.
    void showButtonText(QWidget* button, const QString& text);
    // One or more lines above the widget, arrow down; under it where there is no room. milliseconds: how long
    // it stays, 0 until hide().
    void showPromptText(QWidget* widget, const QString& text, int milliseconds = 0);
    void hide();
    bool isVisible() const;
    // Where it stands, in global coordinates.
    QRect geometry() const;

protected:
    bool eventFilter(QObject* obj, QEvent* event) override;

private:
    static QFont textFont();
    QRect calculateTextRect(const QString& text, int width, int flags) const;
    void setTextRect(const QRect& rect);
    void show(QWidget* widget, const QString& text, int flags, bool below);
    void designballon(QWidget* widget);
    void paintBottomBalloon(QPainter& painter) const;
    void paintTopArrowBalloon(QPainter& painter) const;
    void drawTopArrowTopImage(QPainter& painter) const;
    void drawTopArrowMidImage(QPainter& painter) const;
    void drawTopArrowBottomImage(QPainter& painter) const;
    void drawBottomArrowTopImage(QPainter& painter) const;
    void drawBottomArrowMidImage(QPainter& painter) const;
    void drawBottomArrowBottomImage(QPainter& painter) const;

    QPointer<BalloonWindow> m_window;
    QPointer<QWidget> m_anchor;
    QTimer* m_timer; // child of this
    SliceFrame m_frame;
    QPixmap m_arrowUp;
    QPixmap m_arrowDown;
    QString m_text;
    int m_textFlags = 0;
    bool m_below = false;
    QRect m_textRect; // relative to the body
    QRect m_body;     // relative to the window
    MenuPlacement::Placement m_placement;
};
