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

// A balloon beside a widget. It shows the purpose of a button below it, or a prompt above the widget that the
// prompt refers to. It is hidden by hide(), together with the widget, or after its time. GUI thread only.
class Balloon : public QObject
{
    Q_OBJECT
public:
    explicit Balloon(QObject* parent = nullptr);
    ~Balloon() override;

    static constexpr int FONT_SIZE = 29; // in pixels
    // Limits the positions of balloons and is the parent of their windows. If null, the screen is the limit.
    static QWidget* s_ParentWindow;

    // Shows one line below the button with the arrow up, or above it if there is no room. An empty text hides
    // the balloon.
    void showButtonText(QWidget* button, const QString& text);
    // Shows one or more lines above the widget with the arrow down, or below it if there is no room. Hidden
    // after that many milliseconds; 0 for not before hide().
    void showPromptText(QWidget* widget, const QString& text, int milliseconds = 0);
    void hide();
    bool isVisible() const;
    // Returns the rectangle of the balloon in global coordinates.
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
