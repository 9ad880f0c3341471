// Building, painting and language of the dialog; see FolderPickerActions.cpp for the buttons and the editing
// of names, and FolderPickerChanges.cpp for what comes from elsewhere.
#include "library/FolderPicker.h"

#include "canvas/MessageBoxController.h"
#include "document/Archive.h"
#include "document/ArchiveController.h"
#include "library/FolderEditor.h"
#include "library/FolderNameRules.h"
#include "library/FolderPickerFactory.h"
#include "library/TemplateThumbnail.h"
#include "library/TitleFileOperations.h"
#include "library/TitlerUtility.h"
#include "support/ConfinedPath.h"
#include "touchui/CustomTreeDelegete.h"
#include "touchui/KSPushbutton.h"
#include "touchui/KSTreeModel.h"
#include "touchui/KSTreeView.h"
#include "touchui/OneFinger.h"
#include "touchui/WindowPlaceKeeper.h"

#include <QFileInfo>
#include <QHeaderView>
#include <QKeyEvent>
#include <QLabel>
#include <QPainter>
#include <QShowEvent>

const QString FolderPicker::DISPLAY_FILE_SIZE = QStringLiteral("1920 x 1080");
const QSize FolderPicker::FOLDER_PICKER_SIZE(1088, 742);
const QSize FolderPicker::FOLDER_TREEVIEW_SIZE(802, 570);
const QPoint FolderPicker::STARTPOINT_OF_TOP_HSEPARATOR(9, 59);
const QPoint FolderPicker::STARTPOINT_OF_BOTTOM_HSEPARATOR(9, 645);
const QString FolderPicker::COLOR_TRANSPARENT = QStringLiteral("background-color:transparent;");
const QString FolderPicker::FOLDER_NAME_REGEXP = FolderNameRules::PATTERN;

namespace
{

const int TITLE_FONT_SIZE = 28;
const int FONT_SIZE = 24;
const int FRAME_MARGIN = 9;
const int SEPARATOR_HEIGHT = 4;
const int DATE_WIDTH = 250;
const int BUTTON_SPACE = 8;
const int SIDE_MARGIN = FRAME_MARGIN + BUTTON_SPACE; // beside what lies in the frame
constexpr QSize BUTTON_SIZE(160, 48);
// Inside the frame, which is dark by itself.
constexpr QRect MASK_AREA(7, 9, 1088 - 14, 742 - 18);
constexpr QColor FRAME_COLOR(17, 17, 17);
constexpr QColor FRAME_LINE_COLOR(85, 85, 85);

} // namespace

FolderPicker::FolderPicker(QWidget* parent)
    : QDialog(parent, Qt::Dialog | Qt::FramelessWindowHint)
    , mFactory(new FolderPickerFactory(this))
    , mModel(new KSTreeModel(mFactory, FolderPickerFactory::ColumnCount, this))
    , mMasks(this, MASK_AREA)
    , mBackground(QStringLiteral(":/ToolBarbg_bluegrid"))
{
    setObjectName(QStringLiteral("FolderPickerWindow"));
    setStyleSheet(QStringLiteral("QDialog#FolderPickerWindow {font-size:24px; background:rgb(50, 50, 50);}"));
    setAttribute(Qt::WA_AcceptTouchEvents);
    setFixedSize(FOLDER_PICKER_SIZE);
    new WindowPlaceKeeper(this); // child of this
    createTree();
    createDetails();
    createButtons();
    connectTree();
    setSystemLanFont(QFont(QStringLiteral("KST")));
    translateText();
    ChangeButtonState(NEW_FOLDER_AND_CANCEL);
    if (MessageBoxController* messages = MessageBoxController::getInstance())
        connect(messages, &MessageBoxController::signalCloseMessage, this,
                &FolderPicker::reCallcallSoftKeyBoard);
}

FolderPicker::~FolderPicker()
{
    // What the editor and the tree send while they go would reach a dialog that is half gone.
    const QPointer<FolderEditor> editor = mEditor;
    cancelEdit();
    delete editor;
    mTree->disconnect(this);
    delete mTree;
}

void FolderPicker::createTree()
{
    const int between =
        STARTPOINT_OF_BOTTOM_HSEPARATOR.y() - STARTPOINT_OF_TOP_HSEPARATOR.y() - SEPARATOR_HEIGHT;
    const QPoint place(FOLDER_PICKER_SIZE.width() - SIDE_MARGIN - FOLDER_TREEVIEW_SIZE.width(),
                       STARTPOINT_OF_TOP_HSEPARATOR.y() + SEPARATOR_HEIGHT +
                           (between - FOLDER_TREEVIEW_SIZE.height()) / 2);
    mTree = new KSTreeView(this);
    mTree->setObjectName(QStringLiteral("folderTree"));
    mTree->setGeometry(QRect(place, FOLDER_TREEVIEW_SIZE));
    mTree->setModel(mModel);
    mTree->setCheckBoxVisible(false);
    mTree->setSortingEnabled(true);
    mTree->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    mTree->setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOn); // else the columns would jump
    mTree->header()->setStretchLastSection(false);
    mTree->header()->setSectionResizeMode(FolderPickerFactory::NameColumn, QHeaderView::Stretch);
    mTree->header()->setSectionResizeMode(FolderPickerFactory::DateColumn, QHeaderView::Fixed);
    mTree->header()->resizeSection(FolderPickerFactory::DateColumn, DATE_WIDTH);
}

void FolderPicker::createDetails()
{
    const auto label = [this](const QRect& area, const char* name) {
        auto* made = new QLabel(this);
        made->setObjectName(QLatin1String(name));
        made->setTextFormat(Qt::PlainText);
        made->setStyleSheet(COLOR_TRANSPARENT + QStringLiteral("color:rgb(220, 220, 220);"));
        made->setGeometry(area);
        return made;
    };
    mTitle = label(QRect(2 * FRAME_MARGIN, FRAME_MARGIN, HSEPARATOR_LENGTH - 2 * FRAME_MARGIN,
                         STARTPOINT_OF_TOP_HSEPARATOR.y() - FRAME_MARGIN),
                   "folderPickerTitle");
    const int left = FRAME_MARGIN + (mTree->x() - FRAME_MARGIN - LEFT_WIDTH) / 2;
    mThumbnail = label(QRect(left, mTree->y(), LEFT_WIDTH, WIDGET_HEIGHT), "folderThumbnail");
    mSizeLabel =
        label(QRect(left, mTree->y() + WIDGET_HEIGHT + FRAME_MARGIN, LEFT_WIDTH, 34), "folderFileSize");
    mSizeLabel->setAlignment(Qt::AlignHCenter | Qt::AlignVCenter);
    clearThumbnailArea();
}

void FolderPicker::createButtons()
{
    const char* names[] = {"duplicateFolderButton", "newFolderButton", "openFolderButton",
                           "cancelFolderButton"};
    const int right = mTree->geometry().right() + 1;
    const int left = SIDE_MARGIN;
    const int step = BUTTON_SIZE.width() + BUTTON_SPACE;
    const int places[] = {left, left + step, right - step - BUTTON_SIZE.width(), right - BUTTON_SIZE.width()};
    const int top = STARTPOINT_OF_BOTTOM_HSEPARATOR.y() + SEPARATOR_HEIGHT;
    const int y = top + (FOLDER_PICKER_SIZE.height() - FRAME_MARGIN - top - BUTTON_SIZE.height()) / 2;
    for (int id = 0; id < ButtonCount; ++id) {
        auto* button = new KSPushbutton(QString::fromLatin1(KSPushbutton::STANDARD_IMAGES), this);
        button->setObjectName(QLatin1String(names[id]));
        button->setStyleSheet(QStringLiteral("font-size:24px; color:rgb(220, 220, 220);"));
        button->setGeometry(QRect(QPoint(places[id], y), BUTTON_SIZE));
        button->setAutoDefault(false);
        button->setButtonId(id);
        connect(button, qOverload<int>(&KSPushbutton::pressed), this, &FolderPicker::slotButtonPressed);
        connect(button, qOverload<bool, int>(&KSPushbutton::signalReleased), this,
                &FolderPicker::slotButtonReleased);
        mButtons[id] = button;
    }
    connect(mButtons[DuplicateButton], &QAbstractButton::clicked, this, &FolderPicker::duplicateFolder);
    connect(mButtons[CreateButton], &QAbstractButton::clicked, this, &FolderPicker::createFolder);
    connect(mButtons[OpenButton], &QAbstractButton::clicked, this, &FolderPicker::openFolder);
    connect(mButtons[CancelButton], &QAbstractButton::clicked, this, &FolderPicker::cancelFolder);
}

void FolderPicker::connectTree()
{
    connect(mTree, &QAbstractItemView::pressed, this, &FolderPicker::pressedFolder);
    connect(mTree, &QTreeView::collapsed, this, &FolderPicker::pressedFolder);
    connect(mTree, &QTreeView::expanded, this, &FolderPicker::pressedFolder);
    connect(mTree, &KSTreeView::signalCurrentChangedByTouch, this, &FolderPicker::slotCurrentChangedByTouch);
    connect(mTree, &KSTreeView::signalPressedAndHold, this, &FolderPicker::startEditing);
    connect(mTree->header(), &QHeaderView::sectionClicked, this, &FolderPicker::slotHeaderClicked);
    connect(mTree->treeDelegate(), &CustomTreeDelegete::signalLineEditCommitted, this, &FolderPicker::doEdit);
    connect(mFactory, &FolderPickerFactory::signalCreateEditor, this, &FolderPicker::slotCreateEditor);
    for (QObject* object : std::initializer_list<QObject*>{mTree, mTree->viewport(), mTree->header(),
                                                           mTree->header()->viewport()})
        object->installEventFilter(this);
}

FolderEditor* FolderPicker::editor() const
{
    return mEditor;
}

void FolderPicker::slotButtonPressed(int id)
{
    if (id >= 0 && id < ButtonCount)
        mButtons[id]->changeButtonState(KSPushbutton::ButtonPressed);
}

void FolderPicker::slotButtonReleased(bool, int id)
{
    if (id >= 0 && id < ButtonCount)
        mButtons[id]->changeButtonState(mButtons[id]->isEnabled() ? KSPushbutton::ButtonRest
                                                                  : KSPushbutton::ButtonDisabled);
}

void FolderPicker::ChangeButtonState(folderButtonState state)
{
    const bool none = state == NO_BUTTONS;
    mButtons[DuplicateButton]->setEnabled(!none && state != NO_DUPLICATE && state != OPEN_AND_CANCEL &&
                                          state != NEW_FOLDER_AND_CANCEL);
    mButtons[CreateButton]->setEnabled(!none && state != OPEN_AND_CANCEL);
    mButtons[OpenButton]->setEnabled(!none && state != NEW_FOLDER_AND_CANCEL);
    mButtons[CancelButton]->setEnabled(!none);
}

void FolderPicker::setDuplicateButtonEnabled(bool enabled)
{
    mButtons[DuplicateButton]->setEnabled(enabled);
}

void FolderPicker::setCreateFolderButtonEnabled(bool enabled)
{
    mButtons[CreateButton]->setEnabled(enabled);
}

void FolderPicker::setCancelButtonEnabled(bool enabled)
{
    mButtons[CancelButton]->setEnabled(enabled);
}

void FolderPicker::setSystemLanFont(QFont font)
{
    font.setPixelSize(TITLE_FONT_SIZE);
    mTitle->setFont(font);
    font.setPixelSize(FONT_SIZE);
    mItemFont = font;
    mSizeLabel->setFont(font);
    for (KSPushbutton* button : mButtons)
        button->setFont(font);
    mTree->header()->setFont(font);
    mFactory->setItemFont(font);
    mModel->setAttributeOfAll(Qt::FontRole, font);
}

void FolderPicker::translateText()
{
    mTitle->setText(tr("Select Folder"));
    mUntitled = tr("Untitled");
    mButtons[DuplicateButton]->setText(tr("Duplicate"));
    mButtons[CreateButton]->setText(tr("New Folder"));
    mButtons[OpenButton]->setText(tr("Open"));
    mButtons[CancelButton]->setText(tr("Cancel"));
    mModel->setHeaderData(FolderPickerFactory::NameColumn, Qt::Horizontal, tr("Name"));
    mModel->setHeaderData(FolderPickerFactory::DateColumn, Qt::Horizontal, tr("Date"));
}

void FolderPicker::showOpacityWidget(bool show)
{
    if (mOpacity == nullptr) {
        mOpacity = new QWidget(this);
        mOpacity->setFocusPolicy(Qt::NoFocus);
        QPalette dark;
        dark.setColor(QPalette::Window, QColor(0, 0, 0, 166));
        mOpacity->setPalette(dark);
        mOpacity->setAutoFillBackground(true);
        mOpacity->setGeometry(rect());
    }
    mOpacity->raise();
    mOpacity->setVisible(show);
}

// --- The pressed title ----------------------------------------------------------------------------------

void FolderPicker::initThumbnailArea(const QString& path)
{
    const QImage picture = TemplateThumbnail::read(path);
    mThumbnail->setPixmap(QPixmap::fromImage(TemplateThumbnail::onChecker(picture)));
    mThumbnail->show();
    mSizeLabel->setText(DISPLAY_FILE_SIZE);
}

void FolderPicker::updateThumbnailArea(const QString& path)
{
    // A title with a background of its own has a small picture of that one's kind.
    Archive archive;
    if (ArchiveController().getOneArchive(path, &archive) && !archive.getThumbnailSmall().empty()) {
        initThumbnailArea(archive.getFullPathOfThumbnailSmall());
        return;
    }
    const std::string title = path.toStdString();
    const std::string name = TitlerUtility::getThumbnailNameFromTitlePath(
        title, TitleFileOperations::THUMBNAIL_SMALL.toStdString());
    initThumbnailArea(QString::fromStdString(ConfinedPath::namedByTitle(
        QFileInfo(path).path().toStdString(), TitlerUtility::getThumbnailPathFromTitlePath(title, name))));
}

void FolderPicker::clearThumbnailArea()
{
    mThumbnail->hide();
    mThumbnail->setPixmap(QPixmap());
    mSizeLabel->clear();
}

// --- Events ---------------------------------------------------------------------------------------------

void FolderPicker::paintEvent(QPaintEvent* event)
{
    QDialog::paintEvent(event);
    QPainter painter(this);
    painter.fillRect(rect(), FRAME_COLOR);
    painter.fillRect(MASK_AREA, QColor(50, 50, 50));
    painter.setClipRect(MASK_AREA);
    painter.drawPixmap(0, 0, mBackground);
    painter.setClipping(false);
    painter.setPen(FRAME_LINE_COLOR);
    painter.drawRect(MASK_AREA.adjusted(0, 0, -1, -1));
    painter.drawRect(rect().adjusted(0, 0, -1, -1));
    const QImage line(QStringLiteral(":/Separator_H"));
    for (const QPoint& start : {STARTPOINT_OF_TOP_HSEPARATOR, STARTPOINT_OF_BOTTOM_HSEPARATOR})
        painter.drawImage(QRect(start, QSize(HSEPARATOR_LENGTH, SEPARATOR_HEIGHT)), line);
}

void FolderPicker::showEvent(QShowEvent* event)
{
    QDialog::showEvent(event);
    if (const QWidget* window = parentWidget())
        move(window->mapToGlobal(window->rect().center()) - rect().center());
}

// However it was closed, no name stays half edited.
void FolderPicker::hideEvent(QHideEvent* event)
{
    if (!event->spontaneous()) {
        cancelEdit();
        mMessageUp = false;
    }
    QDialog::hideEvent(event);
}

void FolderPicker::reject()
{
    if (mButtons[CancelButton]->isEnabled())
        cancelFolder();
}

bool FolderPicker::eventFilter(QObject* object, QEvent* event)
{
    if (event->type() == QEvent::KeyPress) {
        switch (static_cast<QKeyEvent*>(event)->key()) {
        case Qt::Key_Home:
        case Qt::Key_End:
        case Qt::Key_PageUp:
        case Qt::Key_PageDown:
            return true;
        default:
            break;
        }
    }
    if (!filterWhileEditing(event))
        return QDialog::eventFilter(object, event);
    if (event->type() == QEvent::TouchEnd)
        OneFinger::cancelTouchOf(object);
    return true;
}

bool FolderPicker::filterWhileEditing(QEvent* event)
{
    switch (event->type()) {
    case QEvent::MouseMove:
    case QEvent::MouseButtonRelease:
    case QEvent::TouchUpdate:
    case QEvent::TouchEnd:
        return mMessageUp;
    case QEvent::MouseButtonPress:
    case QEvent::MouseButtonDblClick:
    case QEvent::TouchBegin:
        return mEditing && renameAction();
    default:
        return false;
    }
}
