#include "library/FolderPicker.h"

#include "canvas/MessageBoxController.h"
#include "library/FolderEditor.h"
#include "library/FolderNameRules.h"
#include "library/FolderPickerFactory.h"
#include "library/IEditContext.h"
#include "library/ListMessages.h"
#include "library/TitlePreview.h"
#include "support/ConfinedPath.h"
#include "support/LogManager.h"
#include "support/RefusedWrites.h"
#include "touchui/KSInputContext.h"
#include "touchui/KSPushbutton.h"
#include "touchui/KSTreeModel.h"
#include "touchui/KSTreeView.h"
#include "touchui/KSVIEW.h"
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
const int SIDE_MARGIN = FRAME_MARGIN + BUTTON_SPACE; // between the frame and the widgets
constexpr QSize BUTTON_SIZE(160, 48);
// Area of the frame, which is drawn dark.
constexpr QMargins FRAME(7, 9, 7, 9);
constexpr QColor FRAME_COLOR(17, 17, 17);
constexpr QColor FRAME_LINE_COLOR(85, 85, 85);

void logTap(const wchar_t* text)
{
    LOG_USER_OPERATE(L"Folder Area", 200, text);
}

QString plainName(const std::wstring& nameOrPath)
{
    return QString::fromStdWString(nameOrPath).section(QLatin1Char('/'), -1, -1, QString::SectionSkipEmpty);
}

// Returns whether the current row is a title in that folder and the folder is collapsed.
bool isCurrentHiddenBy(const KSTreeView& tree, const QModelIndex& folder)
{
    return tree.currentIndex().parent() == folder && !tree.isExpanded(folder);
}

bool checkCanShowTemplate(const FolderRows& rows, const QModelIndex& index)
{
    const QModelIndex folder = rows.folderOf(index);
    if ((!rows.hasTitles(folder) || IEditContext::isCreateNewNow()) &&
        rows.disk().isDiskFull(rows.folderPath(rows.nameOf(folder)), false)) {
        ListMessages::post(MessageDef::MESSAGE_DISK_FULL_ON_CREATE, FolderPicker::tr("File"));
        return false;
    }
    return true;
}

bool checkCanCreateNew(const FolderRows& rows, const QModelIndex& index)
{
    if (IEditContext::isCreateNewNow() &&
        rows.titleCount(rows.folderOf(index)) == ListMessages::TITLE_LIMIT) {
        ListMessages::post(MessageDef::MESSAGE_FOLDER_EXISTS);
        return false;
    }
    return true;
}

} // namespace

FolderPicker::FolderPicker(QWidget* parent)
    : QDialog(parent, Qt::Dialog | Qt::FramelessWindowHint)
    , mRows(this)
    , mMasks(this, FRAME)
    , mBackground(QStringLiteral(":/ToolBarbg_bluegrid"))
    , mSeparator(QStringLiteral(":/Separator_H"))
{
    setObjectName(QStringLiteral("FolderPickerWindow"));
    setStyleSheet(QStringLiteral("QDialog#FolderPickerWindow {font-size:24px; background:rgb(50, 50, 50);}"));
    setAttribute(Qt::WA_AcceptTouchEvents);
    setFixedSize(FOLDER_PICKER_SIZE);
    new WindowPlaceKeeper(this); // owned by this dialog
    createTree();
    mEdit = std::make_unique<FolderNameEdit>(&mRows, mTree, nullptr);
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
    // Deleted first, so that their signals do not reach a partly destroyed dialog.
    const QPointer<FolderEditor> editor = mEdit->editor();
    mEdit->cancelEdit();
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
    mTree->setModel(mRows.model());
    mTree->setCheckBoxVisible(false);
    mTree->setSortingEnabled(true);
    mTree->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    // Otherwise the columns would change their width.
    mTree->setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOn);
    mTree->header()->setStretchLastSection(false);
    mTree->header()->setSectionResizeMode(FolderPickerFactory::NameColumn, QHeaderView::Stretch);
    mTree->header()->setSectionResizeMode(FolderPickerFactory::DateColumn, QHeaderView::Fixed);
    mTree->header()->resizeSection(FolderPickerFactory::DateColumn, DATE_WIDTH);
}

void FolderPicker::createDetails()
{
    mTitle =
        TitlePreview::createLabel(this,
                                  QRect(2 * FRAME_MARGIN, FRAME_MARGIN, HSEPARATOR_LENGTH - 2 * FRAME_MARGIN,
                                        STARTPOINT_OF_TOP_HSEPARATOR.y() - FRAME_MARGIN),
                                  "folderPickerTitle");
    const int left = FRAME_MARGIN + (mTree->x() - FRAME_MARGIN - LEFT_WIDTH) / 2;
    mPreview = std::make_unique<TitlePreview>(this, QPoint(left, mTree->y()));
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
        connect(button, &QAbstractButton::pressed, this,
                [button] { button->changeButtonState(KSPushbutton::ButtonPressed); });
        connect(button, qOverload<bool, int>(&KSPushbutton::signalReleased), this, [button] {
            button->changeButtonState(button->isEnabled() ? KSPushbutton::ButtonRest
                                                          : KSPushbutton::ButtonDisabled);
        });
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
    connect(mEdit.get(), &FolderNameEdit::folderMoved, this, &FolderPicker::folderMoved);
    connect(mEdit.get(), &FolderNameEdit::rowAdded, this, [this] { mPreview->clearThumbnailArea(); });
    connect(mEdit.get(), &FolderNameEdit::unmadeRowDropped, this, [this](bool isFolderCurrent) {
        mPreview->clearThumbnailArea();
        if (isVisible())
            ChangeButtonState(isFolderCurrent ? ALL_BUTTONS : NEW_FOLDER_AND_CANCEL);
    });
    for (QObject* object : std::initializer_list<QObject*>{mTree, mTree->viewport(), mTree->header(),
                                                           mTree->header()->viewport()})
        object->installEventFilter(this);
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
    mPreview->setFont(font);
    for (KSPushbutton* button : mButtons)
        button->setFont(font);
    mTree->header()->setFont(font);
    mRows.factory()->setItemFont(font);
    mRows.model()->setAttributeOfAll(Qt::FontRole, font);
}

void FolderPicker::translateText()
{
    mTitle->setText(tr("Select Folder"));
    mUntitled = tr("Untitled");
    mButtons[DuplicateButton]->setText(tr("Duplicate"));
    mButtons[CreateButton]->setText(tr("New Folder"));
    mButtons[OpenButton]->setText(tr("Open"));
    mButtons[CancelButton]->setText(tr("Cancel"));
    mRows.model()->setHeaderData(FolderPickerFactory::NameColumn, Qt::Horizontal, tr("Name"));
    mRows.model()->setHeaderData(FolderPickerFactory::DateColumn, Qt::Horizontal, tr("Date"));
}

void FolderPicker::showOpacityWidget(bool show)
{
    if (mOpacity == nullptr)
        mOpacity = DialogMasks::createMask(this, rect());
    mOpacity->raise();
    mOpacity->setVisible(show);
}

void FolderPicker::updateTreeView()
{
    mEdit->cancelEdit();
    mRows.reload();
    mTree->scrollToTop();
    mPreview->clearThumbnailArea();
    mButtons[DuplicateButton]->setEnabled(false);
    mButtons[OpenButton]->setEnabled(false);
}

// --- The tree -------------------------------------------------------------------------------------------

void FolderPicker::pressedFolder(QModelIndex indexPress)
{
    if (!indexPress.isValid())
        return;
    // Expanding or collapsing a folder selects it, so that the buttons act on what was touched last. A
    // selected title of the folder stays selected while it is visible.
    const QPersistentModelIndex pressed = indexPress.siblingAtColumn(FolderPickerFactory::NameColumn);
    if (mRows.folderOf(mTree->currentIndex()) != mRows.folderOf(pressed) ||
        isCurrentHiddenBy(*mTree, pressed))
        mTree->setCurrentIndex(pressed);
    const QModelIndex current = mTree->currentIndex();
    if (mRows.checkItemisFolder(current)) {
        ChangeButtonState(ALL_BUTTONS);
        mPreview->clearThumbnailArea();
        return;
    }
    ChangeButtonState(NO_DUPLICATE);
    mPreview->updateThumbnailArea(mRows.titleFile(current).filePath());
}

void FolderPicker::slotCurrentChangedByTouch(QModelIndex)
{
    logTap(L"Select Folder or File");
}

void FolderPicker::slotHeaderClicked(int column)
{
    const QString name = mRows.model()->headerData(column, Qt::Horizontal).toString();
    const bool ascending = mTree->header()->sortIndicatorOrder() == Qt::AscendingOrder;
    LOG_USER_OPERATE(L"File List", 200,
                     L"Sort by Column: " + name.toStdWString() +
                         (ascending ? L" in AscendingOrder order" : L" in DescendingOrder order"));
}

void FolderPicker::startEditing(QModelIndex index)
{
    if (mEdit->isActive() || !index.isValid() || index.column() != FolderPickerFactory::NameColumn ||
        !mRows.checkItemisFolder(index) || !index.data(KSVIEW::ItemEditableRole).toBool() ||
        isVanished(index))
        return;
    mEdit->startRename(index);
}

// Returns whether the folder was deleted without a notice by another process, and removes its row then.
bool FolderPicker::isVanished(const QModelIndex& index)
{
    const QString name = mRows.nameOf(mRows.folderOf(index));
    if (!index.isValid() || mRows.disk().isTitleFolder(mRows.regetRootPath(), name))
        return false;
    slotDeleteFolder(name.toStdWString());
    return true;
}

void FolderPicker::showSoftKeyboard()
{
    if (mEdit->isActive())
        mEdit->callSoftKeyBoard();
}

// --- The buttons ----------------------------------------------------------------------------------------

// Ends the edit of a name before another action. Returns true when the edit has to continue.
bool FolderPicker::isEditKept()
{
    return mEdit->isActive() && mEdit->renameAction();
}

void FolderPicker::createFolder()
{
    logTap(L"Tap New Folder Button");
    if (isEditKept())
        return;
    if (mRows.disk().isDiskFull(mRows.regetRootPath(), false)) {
        ListMessages::post(MessageDef::MESSAGE_DISK_FULL_ON_CREATE, tr("folder"));
        return;
    }
    if (mEdit->startCreate(mUntitled))
        ChangeButtonState(ALL_BUTTONS);
}

void FolderPicker::duplicateFolder()
{
    logTap(L"Tap Duplicate Button");
    if (isEditKept())
        return;
    const QModelIndex source = mRows.folderOf(mTree->currentIndex());
    if (!source.isValid() || isVanished(source))
        return;
    const QString name = mRows.nameOf(source);
    mRows.regetRootPath();
    if (mRows.disk().isDiskFull(mRows.folderPath(name), true)) {
        ListMessages::post(MessageDef::MESSAGE_DISK_FULL_ON_DUPLICATE, tr("folder"));
        return;
    }
    mEdit->startDuplicate(name, source);
}

void FolderPicker::openFolder()
{
    logTap(L"Tap Open Button");
    if (isEditKept())
        return;
    const QModelIndex current = mTree->currentIndex().siblingAtColumn(FolderPickerFactory::NameColumn);
    if (!current.isValid() || isVanished(current) || !checkCanShowTemplate(mRows, current) ||
        !checkCanCreateNew(mRows, current))
        return;
    const QString name = mRows.nameOf(mRows.folderOf(current));
    mKeepDialog = false;
    if (mRows.checkItemisFolder(current))
        Q_EMIT changeFolderPath(mRows.folderPath(name));
    else
        Q_EMIT changeFolderFile(mRows.folderPath(name), mRows.titleFile(current).fileName());
    setCurrentFolderName(name);
    if (mKeepDialog) {
        mKeepDialog = false;
        return;
    }
    if (KSInputContext* context = KSInputContext::instance(); context && parentWidget())
        context->setWindowID(parentWidget()->winId());
    done(Accepted);
    Q_EMIT clearUndoCommandStack();
}

void FolderPicker::cancelFolder()
{
    logTap(L"Tap Cancel Button");
    mEdit->cancelEdit();
    done(Rejected);
    Q_EMIT signalCancelClicked();
}

// --- What other processes do to folders -----------------------------------------------------------------

void FolderPicker::folderNameChanged(FileManagerDefine::tagChangeFolderNameParam param)
{
    const QString before = plainName(param.oldPath);
    const QString after = plainName(param.newPath);
    if (!FolderNameRules::isFolderName(before) || !FolderNameRules::isFolderName(after))
        return;
    const QString oldPath = mRows.regetRootPath() + QLatin1Char('/') + before;
    const QString newPath = mRows.folderPath(after);
    if (!mRows.disk().staysBelow(mRows.regetRootPath(), after)) {
        ConfinedPath::logRefusal(L"a folder is said to be called like a link: ", newPath.toStdString());
        return;
    }
    Q_EMIT folderMoved(oldPath, newPath);
    if (mRows.isNameOf(before, currentFolderName())) {
        mRows.openFolderRenamed(after);
        Q_EMIT folderNameChange(oldPath, newPath);
        // The undo steps, including that of text just being typed, contain the old path.
        Q_EMIT clearUndoCommandStack();
    }
    if (isVisible())
        renameRow(before, after);
}

void FolderPicker::renameRow(const QString& before, const QString& after)
{
    mEdit->sourceRenamed(before, after);
    mRows.factory()->renameFolder(before, after);
    if (mEdit->isRenaming(before)) {
        continuefolderNameChanged(after); // continues the edit from the new name
        return;
    }
    const QModelIndex index = mRows.getFolderIndex(before, mEdit->row());
    if (index.isValid()) {
        mRows.setAttributeAtDoEdit(index, after);
        mRows.insertChildrenIndex(index, after);
    }
    mRows.factory()->importSourceData();
    mTree->viewport()->update();
}

void FolderPicker::slotDeleteFolder(std::wstring name)
{
    const QString folder = plainName(name);
    const QString path = mRows.folderPath(folder);
    if (FolderNameRules::isFolderName(folder) && !QFileInfo::exists(path))
        RefusedWrites::forgetFolder(path.toStdString()); // pending writes for a deleted folder are dropped
    if (mRows.isNameOf(folder, currentFolderName()))
        setCurrentFolderName(QString());
    const QModelIndex index = mRows.getFolderIndex(folder, mEdit->unmadeRow());
    if (!index.isValid())
        return;
    const QModelIndex current = mRows.folderOf(mTree->currentIndex());
    if (isVisible() && current.isValid() && current == index) {
        ChangeButtonState(NEW_FOLDER_AND_CANCEL);
        mTree->setCurrentIndex(QModelIndex());
        mPreview->clearThumbnailArea();
    }
    mRows.remove(index);
}

// --- Events ---------------------------------------------------------------------------------------------

void FolderPicker::paintEvent(QPaintEvent* event)
{
    QDialog::paintEvent(event);
    QPainter painter(this);
    painter.fillRect(rect(), FRAME_COLOR);
    const QRect inside = rect().marginsRemoved(FRAME);
    painter.fillRect(inside, QColor(50, 50, 50));
    painter.setClipRect(inside);
    painter.drawPixmap(0, 0, mBackground);
    painter.setClipping(false);
    painter.setPen(FRAME_LINE_COLOR);
    painter.drawRect(inside.adjusted(0, 0, -1, -1));
    painter.drawRect(rect().adjusted(0, 0, -1, -1));
    for (const QPoint& start : {STARTPOINT_OF_TOP_HSEPARATOR, STARTPOINT_OF_BOTTOM_HSEPARATOR})
        painter.drawImage(QRect(start, QSize(HSEPARATOR_LENGTH, SEPARATOR_HEIGHT)), mSeparator);
}

void FolderPicker::showEvent(QShowEvent* event)
{
    QDialog::showEvent(event);
    if (const QWidget* window = parentWidget())
        move(window->mapToGlobal(window->rect().center()) - rect().center());
}

// Cancels an edit when the dialog is hidden, however it was closed.
void FolderPicker::hideEvent(QHideEvent* event)
{
    if (!event->spontaneous()) {
        mEdit->cancelEdit();
        mEdit->forgetMessage();
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
        return mEdit->isMessageUp();
    case QEvent::MouseButtonPress:
    case QEvent::MouseButtonDblClick:
    case QEvent::TouchBegin:
        return isEditKept();
    default:
        return false;
    }
}
