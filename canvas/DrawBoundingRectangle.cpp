#include "canvas/DrawBoundingRectangle.h"

#include <QPainter>

namespace
{

constexpr int LIKE_DIALOG = 7; // kind whose middle is drawn first

QStringList pieceNames(const QString& prefix, const QString& bottom)
{
    QStringList names;
    for (const QString& row : {bottom, QStringLiteral("Middle"), QStringLiteral("Upper")})
        for (const char* column : {"_Right", "_Center", "_Left"})
            names.append(prefix + row + QLatin1String(column));
    return names;
}

} // namespace

DrawBoundingRectangle::DrawBoundingRectangle(QObject* parent)
    : QObject(parent)
    , m_paneOne(pieceNames(QStringLiteral(":/PanelBG/Pane_1_"), QStringLiteral("Bottom")))
    , m_paneTwo(pieceNames(QStringLiteral(":/PanelBG/Pane_2_"), QStringLiteral("Bottom")))
    , m_dialogBase(pieceNames(QStringLiteral(":/PanelBG/Dialog_base_"), QStringLiteral("Bottom")))
    , m_smallDialogBase(pieceNames(QStringLiteral(":/dialog_base/dialog_base_"), QStringLiteral("bottom")))
{
}

DrawBoundingRectangle::Background DrawBoundingRectangle::backgroundOf(int kind) const
{
    switch (kind) {
    case 1:
        return {&m_paneOne, QSize(1902, 1064)};
    case 2:
        return {&m_paneTwo, QSize(547, 1002)};
    case 3:
        return {&m_smallDialogBase, QSize(389, 121)};
    case 4:
        return {&m_dialogBase, QSize(654, 351)};
    case 5:
        return {&m_dialogBase, QSize(1088, 742)};
    case 6:
        return {&m_paneTwo, QSize(802, 568)};
    case LIKE_DIALOG:
        return {&m_smallDialogBase, QSize(1371, 833)};
    case 8:
        return {&m_paneTwo, QSize(1053, 599)};
    case 9:
        return {&m_dialogBase, QSize(200, 210)};
    default:
        return {};
    }
}

QPixmap DrawBoundingRectangle::paintBoundingRectangle(int kind)
{
    const Background background = backgroundOf(kind);
    if (background.names == nullptr)
        return QPixmap();
    return kind == LIKE_DIALOG ? drawImageLikeAsKSDialog(*background.names, background.size)
                               : drawImage(*background.names, background.size);
}

void DrawBoundingRectangle::paintBackground(QPainter& painter, const QPoint& corner, int kind)
{
    const Background background = backgroundOf(kind);
    if (background.names == nullptr || kind == LIKE_DIALOG)
        return;
    if (m_loaded != *background.names && !loadPieces(*background.names))
        return;
    painter.translate(corner);
    drawTopImage(painter, background.size);
    drawMiddleImage(painter, background.size);
    drawBottomImage(painter, background.size);
    painter.translate(-corner);
}

bool DrawBoundingRectangle::loadPieces(const QStringList& names)
{
    if (names.size() != PieceCount)
        return false;
    for (int i = 0; i < PieceCount; ++i)
        m_pieces[i] = QImage(names.at(i)).convertToFormat(QImage::Format_ARGB32_Premultiplied);
    m_loaded = names;
    return true;
}

QPixmap DrawBoundingRectangle::drawImage(const QStringList& names, const QSize& size)
{
    QPixmap result(size);
    result.fill(Qt::transparent);
    if (result.isNull() || !loadPieces(names))
        return result;
    QPainter painter(&result);
    drawTopImage(painter, size);
    drawMiddleImage(painter, size);
    drawBottomImage(painter, size);
    return result;
}

QPixmap DrawBoundingRectangle::drawImageLikeAsKSDialog(const QStringList& names, const QSize& size)
{
    QPixmap result(size);
    result.fill(Qt::transparent);
    if (result.isNull() || !loadPieces(names))
        return result;
    QPainter painter(&result);
    drawMiddleImage(painter, size);
    drawTopImage(painter, size);
    drawBottomImage(painter, size);
    return result;
}

QSize DrawBoundingRectangle::getSpecifiedTopLeftImage() const
{
    return m_pieces[UpperLeft].size();
}

QSize DrawBoundingRectangle::getSpecifiedBottomImage() const
{
    return m_pieces[BottomLeft].size();
}

void DrawBoundingRectangle::drawTopImage(QPainter& painter, const QSize& size) const
{
    drawRow(painter, 0, getSpecifiedTopLeftImage().height(), size.width(), UpperLeft, UpperCenter,
            UpperRight);
}

void DrawBoundingRectangle::drawMiddleImage(QPainter& painter, const QSize& size) const
{
    const int top = getSpecifiedTopLeftImage().height();
    const int height = size.height() - top - getSpecifiedBottomImage().height();
    drawRow(painter, top, height, size.width(), MiddleLeft, MiddleCenter, MiddleRight);
}

void DrawBoundingRectangle::drawBottomImage(QPainter& painter, const QSize& size) const
{
    const int height = getSpecifiedBottomImage().height();
    drawRow(painter, size.height() - height, height, size.width(), BottomLeft, BottomCenter, BottomRight);
}

void DrawBoundingRectangle::drawRow(QPainter& painter, int y, int height, int width, Piece left, Piece center,
                                    Piece right) const
{
    if (height <= 0)
        return;
    const int leftWidth = m_pieces[left].width();
    const int rightWidth = m_pieces[right].width();
    const int centerWidth = width - leftWidth - rightWidth;
    if (centerWidth > 0)
        painter.drawImage(QRect(leftWidth, y, centerWidth, height), m_pieces[center]);
    painter.drawImage(QRect(0, y, leftWidth, height), m_pieces[left]);
    painter.drawImage(QRect(width - rightWidth, y, rightWidth, height), m_pieces[right]);
}
