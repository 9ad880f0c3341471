#pragma once

#include <QRect>
#include <QString>

class QFont;
class QLabel;
class QPoint;
class QWidget;

// The small picture of the title that is pressed in the folder picker, and the size of titles below it.
// GUI thread.
class TitlePreview
{
public:
    // Shows nothing at first. The parent owns the labels and outlives this object; place is in its
    // coordinates.
    TitlePreview(QWidget* parent, const QPoint& place);

    void setFont(const QFont& font);
    // Shows the picture that the title file names, or else the one beside it. Full path.
    void updateThumbnailArea(const QString& title);
    void clearThumbnailArea();

    // Returns a label in the style of the folder picker.
    static QLabel* createLabel(QWidget* parent, const QRect& area, const char* name);

private:
    void initThumbnailArea(const QString& picture);

    QLabel* m_thumbnail;
    QLabel* m_sizeLabel;
};
