#include "library/ArchiveItem.h"

#include "document/Archive.h"
#include "document/TText.h"
#include "library/SmallPictures.h"

#include <QBrush>
#include <QFontMetrics>
#include <QGraphicsPixmapItem>
#include <QGraphicsScene>
#include <QGraphicsView>
#include <QLabel>
#include <QPainter>
#include <QPixmap>
#include <QPixmapCache>
#include <QTextLayout>
#include <QTextOption>
#include <QtMath>
#include <algorithm>

const QSize ArchiveItem::PICTURE_SIZE(LEFT_CHILD_WIDTH, CHILD_HEIGHT);
const QPoint ArchiveItem::LEFT_CHILD_POS(3, 2);
const QPoint ArchiveItem::RIGHT_CHILD_POS(250, 2);
QString ArchiveItem::SYSTEM_FONT_FAMILY = QStringLiteral("KST");

const QString ArchiveItem::OPERATE_AND_SELECT_STATE = QStringLiteral(
    "ArchiveItem{border: 2px solid rgb(0,186,230);background-color: qlineargradient(spread:pad, x1:0, y1:0, "
    "x2:0, y2:1, stop:0 rgb(64, 94, 185), stop:1 rgb(24, 55, 164))}");
const QString ArchiveItem::OPERATE_AND_UN_SELECT_STATE =
    QStringLiteral("ArchiveItem{border: 2px solid rgb(0,186,230);Background:rgb(51, 51, 51)}");
const QString ArchiveItem::UN_OPERATE_AND_SELECT_STATE = QStringLiteral(
    "ArchiveItem{border: 0px; background: qlineargradient(spread:pad, x1:0, y1:0, x2:0, y2:1, stop:0 rgb(64, "
    "94, 185), stop:1 rgb(24, 55, 164))}");
const QString ArchiveItem::UN_OPERATE_AND_UN_SELECT_STATE =
    QStringLiteral("ArchiveItem{Background:rgb(51, 51, 51)}");

namespace
{

const int NARROW_LABEL_WIDTH = 250;
const int NARROW_LABEL_HEIGHT = 24;
const int NARROW_PADDING_X = 12;
const int NARROW_PADDING_TOP = 8;
const int HANDLE_GAP = 6;      // between the text and the handle for move mode
const int CHECKER_SQUARE = 15; // pixels

QPixmap checkerPicture()
{
    const QPixmap checker(QStringLiteral(":/checker"));
    if (!checker.isNull())
        return checker;
    // Transparency has to differ from black even without the compiled-in picture.
    QPixmap drawn(2 * CHECKER_SQUARE, 2 * CHECKER_SQUARE);
    drawn.fill(QColor(102, 102, 102));
    QPainter painter(&drawn);
    painter.fillRect(0, 0, CHECKER_SQUARE, CHECKER_SQUARE, QColor(153, 153, 153));
    painter.fillRect(CHECKER_SQUARE, CHECKER_SQUARE, CHECKER_SQUARE, CHECKER_SQUARE, QColor(153, 153, 153));
    return drawn;
}

// Cached for all items: finding the picture among the resources takes longer than painting it.
QBrush checkerBrush()
{
    const QString key = QStringLiteral("ArchiveItem checker");
    QPixmap checker;
    if (!QPixmapCache::find(key, &checker)) {
        checker = checkerPicture();
        QPixmapCache::insert(key, checker);
    }
    return QBrush(checker);
}

} // namespace

ArchiveItem::ArchiveItem(Archive* archive, int type, QWidget* parent)
    : KSBaseItemWidget(parent), m_archive(archive), m_type(type)
{
    setFixedSize(m_type == NARROW_ITEM ? RIGHT_CHILD_WIDTH : WIDGET_WIDTH, WIDGET_HEIGHT);
    setStyleSheet(UN_OPERATE_AND_UN_SELECT_STATE);
}

ArchiveItem::~ArchiveItem() = default;

QString ArchiveItem::getArchiveDataPath() const
{
    return m_archive ? QString::fromStdString(m_archive->getPath()) : QString();
}

void ArchiveItem::discard()
{
    m_archive = nullptr;
    hide();
    deleteLater();
}

void ArchiveItem::updateArchiveData(Archive* archive)
{
    if (!archive || !m_archive)
        return;
    const std::string name = m_archive->getName();
    *m_archive = *archive;
    m_archive->setName(name);
}

void ArchiveItem::initArchiveItemChildWidget(const QImage& picture)
{
    if (hasChildWidgets())
        return;
    if (m_type == LIST_ITEM)
        createLeftChild();
    createRightChild();
    updateLeftChild(picture);
    updateRightChild();
    if (hasDragFlag())
        setDragFlag(true); // places the handle above the new children
}

void ArchiveItem::setDragFlag(bool dragFlag)
{
    KSBaseItemWidget::setDragFlag(dragFlag);
    fitLinesToHandle();
}

// Limits the text lines to the space before the handle.
void ArchiveItem::fitLinesToHandle()
{
    if (m_type != LIST_ITEM || !hasChildWidgets())
        return;
    const bool hasHandle = hasDragFlag() && getDragFlagAlignment() == DRAGFLAG_RIGHT;
    const int width =
        hasHandle ? getHandlePos().x() - HANDLE_GAP - RIGHT_CHILD_POS.x() : DISPLY_TEXT_SIZE_LENTH;
    if (m_labels.first()->width() == width)
        return;
    for (QLabel* label : m_labels)
        label->setFixedWidth(width);
    updateRightChild();
}

void ArchiveItem::createLeftChild()
{
    m_scene = new QGraphicsScene(0, 0, LEFT_CHILD_WIDTH, CHILD_HEIGHT, this);
    m_scene->setBackgroundBrush(checkerBrush());
    m_pixmapItem = m_scene->addPixmap(QPixmap());
    // The parent and the style sheet are set first: a widget is styled again, with its children, when either
    // changes later.
    auto* view = new QGraphicsView(m_scene, this);
    view->setStyleSheet(QStringLiteral("border:0;"));
    view->setEnabled(false);
    view->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    view->setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    view->setFixedSize(LEFT_CHILD_WIDTH, CHILD_HEIGHT);
    setChild(view, CHILD_LEFT);
    view->move(LEFT_CHILD_POS);
    view->show();
}

void ArchiveItem::createRightChild()
{
    const bool narrow = m_type == NARROW_ITEM;
    m_textWidget = new QWidget(this);
    setChild(m_textWidget, CHILD_RIGHT);
    m_textWidget->setObjectName(QStringLiteral("mTextWidget"));
    if (narrow)
        m_textWidget->setStyleSheet(QStringLiteral(" QWidget#mTextWidget { background:rgb(38, 38, 38); }"));
    m_textWidget->setFixedSize(RIGHT_CHILD_WIDTH, CHILD_HEIGHT);
    m_textWidget->move(narrow ? QPoint(0, RIGHT_CHILD_POS.y()) : RIGHT_CHILD_POS);

    const QSize line =
        narrow ? QSize(NARROW_LABEL_WIDTH, NARROW_LABEL_HEIGHT) : QSize(DISPLY_TEXT_SIZE_LENTH, LABEL_HEIGHT);
    for (int i = 0; i < LEFT_CHILD_LABEL_COUNT; ++i) {
        auto* label = new QLabel(m_textWidget);
        label->setTextFormat(Qt::PlainText);
        label->setStyleSheet(narrow ? QStringLiteral(" background: transparent; color:rgb(178, 178, 178);")
                                    : QStringLiteral(" background: transparent; color:rgb(220, 220, 220);"));
        label->setFixedSize(line);
        if (narrow)
            label->setContentsMargins(NARROW_PADDING_X, 0, NARROW_PADDING_X, 0);
        label->move(0, (narrow ? NARROW_PADDING_TOP : 0) + i * line.height());
        m_labels.append(label);
    }
    m_textWidget->show();
}

void ArchiveItem::updateContents(QImage image)
{
    if (!hasChildWidgets()) {
        initArchiveItemChildWidget(image); // otherwise the queued completion would show the old picture
        return;
    }
    updateLeftChild(image);
    updateRightChild();
}

void ArchiveItem::updateLeftChild(QImage image)
{
    if (!m_pixmapItem || !m_archive)
        return;
    if (image.isNull())
        image = SmallPictures::read(m_archive->getFullPathOfThumbnailSmall(), PICTURE_SIZE);
    else
        image = SmallPictures::fitted(image, PICTURE_SIZE);
    m_pixmapItem->setPixmap(image.isNull() ? QPixmap() : QPixmap::fromImage(image));
}

void ArchiveItem::updateRightChild()
{
    if (!hasChildWidgets())
        return;
    QFont font(SYSTEM_FONT_FAMILY);
    font.setPixelSize(m_type == NARROW_ITEM ? NARROW_LABEL_HEIGHT - 4 : DISPLY_TEXT_SIZE);
    for (QLabel* label : m_labels) {
        label->setFont(font);
        label->clear();
    }
    setTextArea();
}

// Aligns a line that is higher than its label at the bottom. Some families, including substitutes for missing
// characters, have more space above and below than the label, and descenders must not be cut off.
void ArchiveItem::placeLine(QLabel* label) const
{
    QTextLayout layout(label->text(), label->font());
    layout.beginLayout();
    const QTextLine line = layout.createLine();
    layout.endLayout();
    const bool fits = !line.isValid() || qCeil(line.height()) <= label->height();
    label->setAlignment(Qt::AlignLeft | (fits ? Qt::AlignVCenter : Qt::AlignBottom));
}

void ArchiveItem::setTextArea()
{
    if (!m_archive)
        return;
    const std::vector<TText*>& texts = m_archive->text();
    if (texts.size() == 1)
        setOneTextArea(QString::fromStdString(texts.front()->getText()));
    else if (texts.size() > 1)
        setManyTextArea();
}

// Breaks the text between words into the lines; the last line takes the rest and is elided.
void ArchiveItem::setOneTextArea(const QString& text)
{
    const QString words = text.simplified();
    QTextLayout layout(words, m_labels.first()->font());
    QTextOption wrapping;
    wrapping.setWrapMode(QTextOption::WrapAtWordBoundaryOrAnywhere);
    layout.setTextOption(wrapping);
    layout.beginLayout();
    for (QLabel* label : m_labels) {
        QTextLine line = layout.createLine();
        if (!line.isValid())
            break;
        line.setLineWidth(label->contentsRect().width());
        const bool isLast = label == m_labels.last();
        setLabelText(words.mid(line.textStart(), isLast ? -1 : line.textLength()).trimmed(), label);
    }
    layout.endLayout();
}

void ArchiveItem::setManyTextArea()
{
    std::vector<TText*> texts = m_archive->getText();
    std::stable_sort(texts.begin(), texts.end(), [](const TText* left, const TText* right) {
        return left->getTextObjectID() < right->getTextObjectID();
    });
    const qsizetype lines = std::min<qsizetype>(m_labels.size(), static_cast<qsizetype>(texts.size()));
    for (qsizetype i = 0; i < lines; ++i)
        setLabelText(QString::fromStdString(texts[static_cast<size_t>(i)]->getText()).simplified(),
                     m_labels.at(i));
}

void ArchiveItem::setLabelText(const QString& text, QLabel* label)
{
    const int room = label->contentsRect().width();
    label->setText(QFontMetrics(label->font()).elidedText(text, Qt::ElideRight, room));
    placeLine(label);
}

ArchiveItem* ArchiveItem::clone()
{
    auto archive = m_archive ? std::make_unique<Archive>(*m_archive) : std::make_unique<Archive>();
    auto* item = new ArchiveItem(archive.get(), m_type);
    item->m_ownArchive = std::move(archive);
    item->initArchiveItemChildWidget();
    if (m_pixmapItem && item->m_pixmapItem)
        item->m_pixmapItem->setPixmap(m_pixmapItem->pixmap()); // the pixmap may be newer than the file
    item->setSelected(isSelected());
    item->setStyleSheet(isSelected() ? OPERATE_AND_SELECT_STATE : OPERATE_AND_UN_SELECT_STATE);
    return item;
}

void ArchiveItem::setSystemFontFamily(QString family)
{
    SYSTEM_FONT_FAMILY = family;
}
