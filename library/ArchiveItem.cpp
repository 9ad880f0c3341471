#include "library/ArchiveItem.h"

#include "document/Archive.h"
#include "document/TText.h"
#include "library/CheckeredPicture.h"
#include "library/SmallPictures.h"
#include "library/TitleLines.h"

#include <QColor>
#include <QPainter>
#include <QPixmap>
#include <QPixmapCache>
#include <QStyle>
#include <QStyleOption>
#include <algorithm>
#include <utility>
#include <vector>

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
const int HANDLE_GAP = 6; // between the text and the handle for move mode

TitleLines::Form listForm()
{
    TitleLines::Form form;
    form.line = QSize(ArchiveItem::DISPLY_TEXT_SIZE_LENTH, ArchiveItem::LABEL_HEIGHT);
    form.fontHeight = ArchiveItem::DISPLY_TEXT_SIZE;
    form.text = QColor(220, 220, 220);
    return form;
}

TitleLines::Form narrowForm()
{
    TitleLines::Form form;
    form.line = QSize(NARROW_LABEL_WIDTH, NARROW_LABEL_HEIGHT);
    form.top = NARROW_PADDING_TOP;
    form.padding = NARROW_PADDING_X;
    form.fontHeight = NARROW_LABEL_HEIGHT - 4;
    form.text = QColor(178, 178, 178);
    form.background = QColor(38, 38, 38);
    return form;
}

// Draws on a sample item what the style sheet says.
QPixmap drawLook(const QString& styleSheet, QSize size)
{
    QImage picture(size, QImage::Format_RGB32);
    picture.fill(Qt::black);
    ArchiveItem sample(nullptr, ArchiveItem::LIST_ITEM);
    sample.setFixedSize(size);
    sample.setStyleSheet(styleSheet);
    QStyleOption option;
    option.initFrom(&sample);
    QPainter painter(&picture);
    sample.style()->drawPrimitive(QStyle::PE_Widget, &option, &painter, &sample);
    painter.end();
    return QPixmap::fromImage(std::move(picture));
}

QPixmap lookPicture(const QString& styleSheet, QSize size)
{
    const QString key =
        QStringLiteral("ArchiveItem %1x%2 ").arg(size.width()).arg(size.height()) + styleSheet;
    QPixmap picture;
    if (!QPixmapCache::find(key, &picture)) {
        picture = drawLook(styleSheet, size);
        QPixmapCache::insert(key, picture);
    }
    return picture;
}

static_assert(TitleLines::COUNT == ArchiveItem::LEFT_CHILD_LABEL_COUNT);

} // namespace

ArchiveItem::ArchiveItem(Archive* archive, int type, QWidget* parent)
    : KSBaseItemWidget(Background::Own, parent)
    , m_archive(archive)
    , m_type(type)
    , m_look(UN_OPERATE_AND_UN_SELECT_STATE)
{
    setFixedSize(m_type == NARROW_ITEM ? RIGHT_CHILD_WIDTH : WIDGET_WIDTH, WIDGET_HEIGHT);
    setAttribute(Qt::WA_OpaquePaintEvent);
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
    if (m_lines->lineWidth() != width)
        m_lines->setLineWidth(width);
}

void ArchiveItem::createLeftChild()
{
    m_picture = new CheckeredPicture(this);
    m_picture->setFixedSize(PICTURE_SIZE);
    setChild(m_picture, CHILD_LEFT);
    m_picture->move(LEFT_CHILD_POS);
    m_picture->show();
}

void ArchiveItem::createRightChild()
{
    const bool isNarrow = m_type == NARROW_ITEM;
    m_lines = new TitleLines(isNarrow ? narrowForm() : listForm(), this);
    setChild(m_lines, CHILD_RIGHT);
    m_lines->setObjectName(QStringLiteral("mTextWidget"));
    m_lines->setFixedSize(RIGHT_CHILD_WIDTH, CHILD_HEIGHT);
    m_lines->move(isNarrow ? QPoint(0, RIGHT_CHILD_POS.y()) : RIGHT_CHILD_POS);
    m_lines->show();
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
    if (!m_picture || !m_archive)
        return;
    if (image.isNull())
        image = SmallPictures::read(m_archive->getFullPathOfThumbnailSmall(), PICTURE_SIZE);
    else
        image = SmallPictures::fitted(image, PICTURE_SIZE);
    m_picture->setPicture(image);
}

void ArchiveItem::updateRightChild()
{
    if (hasChildWidgets())
        m_lines->setTexts(shownTexts(), SYSTEM_FONT_FAMILY);
}

// Returns the texts in the order of their numbers.
QStringList ArchiveItem::shownTexts() const
{
    if (!m_archive)
        return {};
    std::vector<TText*> texts = m_archive->text();
    std::stable_sort(texts.begin(), texts.end(), [](const TText* left, const TText* right) {
        return left->getTextObjectID() < right->getTextObjectID();
    });
    QStringList shown;
    for (const TText* text : texts)
        shown.append(QString::fromStdString(text->getText()));
    return shown;
}

// --- Looks ----------------------------------------------------------------------------------------------

void ArchiveItem::setLook(const QString& styleSheet)
{
    if (m_look == styleSheet)
        return;
    m_look = styleSheet;
    m_background = QPixmap();
    update();
}

void ArchiveItem::setSelectedStyle()
{
    setLook(UN_OPERATE_AND_SELECT_STATE);
}

void ArchiveItem::setNormalStyle()
{
    setLook(UN_OPERATE_AND_UN_SELECT_STATE);
}

// The pictures of a lifted item have transparent corners.
void ArchiveItem::setPopup(bool popup)
{
    setAttribute(Qt::WA_OpaquePaintEvent, !popup);
    KSBaseItemWidget::setPopup(popup);
}

void ArchiveItem::paintBackground(QPainter& painter, const QRect& exposed)
{
    if (m_background.size() != size())
        m_background = lookPicture(m_look, size());
    painter.drawPixmap(exposed.topLeft(), m_background, exposed);
}

ArchiveItem* ArchiveItem::clone()
{
    auto archive = m_archive ? std::make_unique<Archive>(*m_archive) : std::make_unique<Archive>();
    auto* item = new ArchiveItem(archive.get(), m_type);
    item->m_ownArchive = std::move(archive);
    item->initArchiveItemChildWidget();
    if (m_picture && item->m_picture)
        item->m_picture->setPicture(m_picture->picture()); // the picture may be newer than the file
    item->setSelected(isSelected());
    item->setLook(isSelected() ? OPERATE_AND_SELECT_STATE : OPERATE_AND_UN_SELECT_STATE);
    return item;
}

void ArchiveItem::setSystemFontFamily(QString family)
{
    SYSTEM_FONT_FAMILY = family;
}
