#include "library/ArchiveItem.h"

#include "document/Archive.h"
#include "document/TText.h"
#include "library/CheckeredPicture.h"
#include "library/SmallPictures.h"

#include <QFontMetrics>
#include <QLabel>
#include <QPixmap>
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
const int HANDLE_GAP = 6; // between the text and the handle for move mode

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
    m_picture = new CheckeredPicture(this);
    m_picture->setFixedSize(PICTURE_SIZE);
    setChild(m_picture, CHILD_LEFT);
    m_picture->move(LEFT_CHILD_POS);
    m_picture->show();
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
    if (!m_picture || !m_archive)
        return;
    if (image.isNull())
        image = SmallPictures::read(m_archive->getFullPathOfThumbnailSmall(), PICTURE_SIZE);
    else
        image = SmallPictures::fitted(image, PICTURE_SIZE);
    m_picture->setPicture(image.isNull() ? QPixmap() : QPixmap::fromImage(image));
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
    if (m_picture && item->m_picture)
        item->m_picture->setPicture(m_picture->picture()); // the picture may be newer than the file
    item->setSelected(isSelected());
    item->setStyleSheet(isSelected() ? OPERATE_AND_SELECT_STATE : OPERATE_AND_UN_SELECT_STATE);
    return item;
}

void ArchiveItem::setSystemFontFamily(QString family)
{
    SYSTEM_FONT_FAMILY = family;
}
