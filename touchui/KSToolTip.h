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

// The one balloon with an arrow that tells the value of a slider or the whole text of a row. GUI thread only.
class KSToolTip : public QObject
{
    Q_OBJECT
public:
    // Made at the first call.
    static KSToolTip* getInstance();
    static void clearInstance();

    // Shows the text by a rectangle in global coordinates, above it where there is room. An empty text hides
    // the balloon.
    static void showText(const QRect& anchor, const QString& text);
    // The same by the slider's handle.
    static void showTextForSlider(const QRect& handle, const QString& text);
    // The same under a row; nothing is shown for a text that the row shows whole.
    static void showTextForTreeView(const QRect& row, const QString& text, int shownWidth = 0);
    static void hideText();
    static bool isVisible();
    // The text as it was given, before it was shortened.
    static QString text() { return s_LongText; }
    static QFont textFont();

    // Bounds the balloon and owns its window; null: the screen does.
    static QWidget* s_mainWindow;

private:
    KSToolTip();
    ~KSToolTip() override;

    void show(const QRect& anchor, const QString& text, bool below);
    QRect calculateTextRect(const QString& text) const;
    // Cuts the end off, with an ellipsis, until the text is no wider.
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
