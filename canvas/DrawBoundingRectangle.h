#pragma once

#include <QImage>
#include <QObject>
#include <QPixmap>
#include <QPoint>
#include <QSize>
#include <QStringList>

class QPainter;

// Paints the nine-piece backgrounds of panes and dialogs from the compiled-in pictures.
class DrawBoundingRectangle : public QObject
{
    Q_OBJECT
public:
    explicit DrawBoundingRectangle(QObject* parent = nullptr);

    // Returns the background of one kind of widget, 1 to 9; a null pixmap for any other kind. Pieces whose
    // picture is missing stay transparent.
    QPixmap paintBoundingRectangle(int kind);
    // Paints the same with its upper-left corner there, without a pixmap of that size. The pictures are kept
    // until another kind is painted. Does nothing for kind 7, whose pieces overlap.
    void paintBackground(QPainter& painter, const QPoint& corner, int kind);

    // The order of the nine picture names in a list.
    enum Piece {
        BottomRight,
        BottomCenter,
        BottomLeft,
        MiddleRight,
        MiddleCenter,
        MiddleLeft,
        UpperRight,
        UpperCenter,
        UpperLeft,
        PieceCount
    };

    // Builds a pixmap of the size from nine pictures: corners in their natural size, the rest stretched.
    QPixmap drawImage(const QStringList& names, const QSize& size);
    // Draws the same pixmap with the middle first, so that the edges of a dialog cover its filling.
    QPixmap drawImageLikeAsKSDialog(const QStringList& names, const QSize& size);

private:
    struct Background {
        const QStringList* names = nullptr; // null for an unknown kind
        QSize size;
    };

    Background backgroundOf(int kind) const;
    bool loadPieces(const QStringList& names);
    QSize getSpecifiedTopLeftImage() const;
    QSize getSpecifiedBottomImage() const;
    void drawTopImage(QPainter& painter, const QSize& size) const;
    void drawMiddleImage(QPainter& painter, const QSize& size) const;
    void drawBottomImage(QPainter& painter, const QSize& size) const;
    void drawRow(QPainter& painter, int y, int height, int width, Piece left, Piece center,
                 Piece right) const;

    QStringList m_paneOne;
    QStringList m_paneTwo;
    QStringList m_dialogBase;
    QStringList m_smallDialogBase;
    QStringList m_loaded; // the names of the pieces
    QImage m_pieces[PieceCount];
};
