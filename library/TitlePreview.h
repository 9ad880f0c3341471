#pragma once

#include <QRect>
#include <QString>

class QFont;
class QLabel;
class QPoint;
class QWidget;

// The small picture of the title that is pressed in the folder picker, with the size of titles below it. GUI
// thread.
class TitlePreview
{
public:
    // Shows nothing at first. The parent owns the labels and must outlive this object; place is in its
    // coordinates.
    TitlePreview(QWidget* parent, const QPoint& place);

    void setFont(const QFont& font);
    // Shows the picture named in the title file, or otherwise the one named after it. Full path.
    void updateThumbnailArea(const QString& title);
    void clearThumbnailArea();

    // Returns a label in the style of the folder picker.
    static QLabel* createLabel(QWidget* parent, const QRect& area, const char* name);

private:
    void initThumbnailArea(const QString& picture);

    QLabel* m_thumbnail;
    QLabel* m_sizeLabel;
};
