#pragma once

#include "touchui/KSBaseItemWidget.h"

#include <QImage>
#include <QList>
#include <QPoint>
#include <QString>
#include <memory>

class Archive;
class CheckeredPicture;
class QLabel;

// One title in the list: its thumbnail on a checker pattern, and the first lines of its texts.
class ArchiveItem : public KSBaseItemWidget
{
    Q_OBJECT

public:
    static const int WIDGET_HEIGHT = 139;
    static const int WIDGET_WIDTH = 505;
    static const int CHILD_HEIGHT = 135;
    static const int LEFT_CHILD_WIDTH = 240;
    static const int RIGHT_CHILD_WIDTH = 254;
    static const int LABEL_HEIGHT = 33;
    static const int DISPLY_TEXT_SIZE = 28; // pixels
    static const int DISPLY_TEXT_SIZE_LENTH = 254;
    static const int LEFT_CHILD_LABEL_COUNT = 4;
    static const QSize PICTURE_SIZE; // size of the thumbnail
    static const QPoint LEFT_CHILD_POS;
    static const QPoint RIGHT_CHILD_POS;

    // Style sheets: the border marks the item that the menu acts on, the gradient the title on the canvas.
    static const QString OPERATE_AND_SELECT_STATE;
    static const QString OPERATE_AND_UN_SELECT_STATE;
    static const QString UN_OPERATE_AND_SELECT_STATE;
    static const QString UN_OPERATE_AND_UN_SELECT_STATE;

    enum ItemType { LIST_ITEM = 0, NARROW_ITEM = 1 };

    // Shows the record, which is not owned and must outlive the item.
    ArchiveItem(Archive* archive, int type, QWidget* parent = nullptr);
    ~ArchiveItem() override;

    Archive* getArchiveData() const { return m_archive; }
    // Detaches the item from its record at once, and deletes it later, when no event is being delivered to
    // it.
    void discard();
    // Returns whether the item is not null and not discarded.
    static bool isUsable(const ArchiveItem* item) { return item && item->m_archive; }
    QString getArchiveDataPath() const;
    // Copies the contents of the given record, but keeps the name in the item's record.
    void updateArchiveData(Archive* archive);

    // Prevents the list from giving the item back; see HeldArchiveItem.
    void hold() { ++m_holds; }
    void letGo() { --m_holds; }
    bool isHeld() const { return m_holds > 0; }

    // Builds the thumbnail and the text lines. Reads the picture file when no picture is given, so the list
    // calls it only for items on screen.
    void initArchiveItemChildWidget(const QImage& picture = QImage());
    bool hasChildWidgets() const { return m_textWidget != nullptr; }

    void updateContents(QImage image);
    // Shows the image; for a null image the title's small picture from its file, or only the checker pattern
    // if there is none.
    void updateLeftChild(QImage image);
    void updateRightChild();

    // Shows or hides the handle; the text lines are shortened to make room for it.
    void setDragFlag(bool dragFlag) override;

    // Returns an item for a copy of the record, which the clone owns. The caller owns the clone.
    ArchiveItem* clone() override;

    // Sets the font family of the text lines of all items; existing items change with updateRightChild().
    static void setSystemFontFamily(QString family);
    static QString SYSTEM_FONT_FAMILY;

private:
    void createLeftChild();
    void createRightChild();
    void fitLinesToHandle();
    void placeLine(QLabel* label) const;
    void setTextArea();
    void setOneTextArea(const QString& text);
    void setManyTextArea();
    void setLabelText(const QString& text, QLabel* label);

    Archive* m_archive;
    std::unique_ptr<Archive> m_ownArchive; // set in clones only
    int m_type;
    int m_holds = 0;
    CheckeredPicture* m_picture = nullptr;
    QWidget* m_textWidget = nullptr;
    QList<QLabel*> m_labels;
};
