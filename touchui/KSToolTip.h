#pragma once

#include "touchui/MenuPlacement.h"
#include "touchui/SliceFrame.h"

#include <QFont>
#include <QObject>
#include <QPointer>
#include <QPolygon>
#include <QRect>

class BalloonWindow;
class QPainter;
class QWidget;

// The only instance of the balloon with an arrow that shows the value of a slider or the whole text of a row.
// GUI thread only.
class KSToolTip : public QObject
{
    Q_OBJECT
public:
    // Created by the first call.
    static KSToolTip* getInstance();
    static void clearInstance();

    // Shows the text beside a rectangle in global coordinates, above it if there is room. An empty text hides
    // the balloon.
    static void showText(const QRect& anchor, const QString& text);
    // Shows the text in the same way beside the slider's handle.
    static void showTextForSlider(const QRect& handle, const QString& text);
    // Shows the text below a row. Hides the balloon if the text fits into shownWidth pixels.
    static void showTextForTreeView(const QRect& row, const QString& text, int shownWidth = 0);
    static void hideText();
    // Returns the full text, even if it is shown elided.
    static QString text() { return s_LongText; }
    static QFont textFont();

    // Limits the position of the balloon and is the parent of its window. If null, the screen is the limit.
    static QWidget* s_mainWindow;

private:
    KSToolTip();
    ~KSToolTip() override;

    void show(const QRect& anchor, const QString& text, bool below);
    QRect calculateTextRect(const QString& text) const;
    // Elides the end of the text until it fits into the width in pixels.
    QString changeTextLength(const QString& text, int width) const;
    MenuPlacement::Placement adjustToolTipPostion(const QRect& anchor, const QSize& size, bool below);
    void paintTop(QPainter& painter, const QRect& rect, const QString& text) const;
    void paintBottom(QPainter& painter, const QRect& rect, const QString& text) const;
    void drawText(QPainter& painter, const QRect& body, const QString& text) const;

    static KSToolTip* s_KsToolTip;
    static QString s_LongText;
    static QPolygon s_points; // the arrow, relative to the balloon

    QPoint m_arrowPoint; // the arrow's tip, relative to the balloon
    QPointer<BalloonWindow> m_window;
    SliceFrame m_frame;
    QPixmap m_arrowUp;
    QPixmap m_arrowDown;
};
