// One title in the list: its thumbnail over a checker, and the first lines of its texts.
#pragma once

#include "touchui/KSBaseItemWidget.h"

#include <QImage>
#include <QList>
#include <QPoint>
#include <QString>
#include <memory>

class Archive;
class QGraphicsPixmapItem;
class QGraphicsScene;
class QGraphicsView;
class QLabel;

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
    static const QSize PICTURE_SIZE; // of the left child
    static const QPoint LEFT_CHILD_POS;
    static const QPoint RIGHT_CHILD_POS;

    // The border marks the item that the menu acts on, the gradient the title on the canvas.
    static const QString OPERATE_AND_SELECT_STATE;
    static const QString OPERATE_AND_UN_SELECT_STATE;
    static const QString UN_OPERATE_AND_SELECT_STATE;
    static const QString UN_OPERATE_AND_UN_SELECT_STATE;

    enum ItemType { LIST_ITEM = 0, NARROW_ITEM = 1 };

    // The record is not owned and must live as long as the item shows it.
    ArchiveItem(Archive* archive, int type, QWidget* parent = nullptr);
    ~ArchiveItem() override;

    Archive* getArchiveData() const { return mArchive; }
    // Ends the item: the record goes now, and the item as soon as nothing is being delivered to it.
    void discard();
    // Whether there is an item, and it has not been discarded.
    static bool isUsable(const ArchiveItem* item) { return item && item->mArchive; }
    QString getArchiveDataPath() const;
    // Takes over the contents of the given record; the name that the item's record has is kept.
    void updateArchiveData(Archive* archive);

    // Held, the item is not given back by its list; see HeldArchiveItem.
    void hold() { ++mHolds; }
    void letGo() { --mHolds; }
    bool isHeld() const { return mHolds > 0; }

    // Builds the thumbnail and the text lines. Without a picture it costs a picture file, so the list does it
    // once it is on screen.
    void initArchiveItemChildWidget(const QImage& picture = QImage());
    bool hasChildWidgets() const { return mTextWidget != nullptr; }

    void updateContents(QImage image);
    // A null image shows the title's small picture from its file, or the bare checker when there is none.
    void updateLeftChild(QImage image);
    void updateRightChild();

    // The lines that are shown, for those who cannot see them.
    QStringList textLines() const;

    // The text lines make room for the handle.
    void setDragFlag(bool dragFlag) override;

    // An item of a copied record, which the clone owns. The caller owns the clone.
    ArchiveItem* clone() override;

    // Family of the text lines of all items; items that exist follow with updateRightChild.
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

    Archive* mArchive;
    std::unique_ptr<Archive> mOwnArchive; // only of a clone
    int mType;
    int mHolds = 0;
    QGraphicsScene* mScene = nullptr;
    QGraphicsPixmapItem* mPixmapItem = nullptr;
    QWidget* mTextWidget = nullptr;
    QList<QLabel*> mLabels;
};
