// The buttons of the folder picker, and the editing of names.
#include "canvas/MessageBoxController.h"
#include "document/ITitleChangeReporter.h"
#include "library/FolderEditor.h"
#include "library/FolderNameRules.h"
#include "library/FolderPicker.h"
#include "library/FolderPickerFactory.h"
#include "library/IEditContext.h"
#include "library/ITitlerFolderReporter.h"
#include "library/ListMessages.h"
#include "support/LogManager.h"
#include "touchui/KSInputContext.h"
#include "touchui/KSModelDataItem.h"
#include "touchui/KSTreeModel.h"
#include "touchui/KSTreeView.h"
#include "touchui/KSVIEW.h"

#include <QEvent>
#include <QHeaderView>

namespace
{

// "<keyboard type>#<title>#<selection mode>#<last value>"
const char KEYBOARD_FIELD[] = "2#%1#0#2";

const int LIMIT_NONE = 0;
const int LIMIT_CHARACTERS = 4001;
const int LIMIT_LENGTH = 4002;

void logTap(const wchar_t* text)
{
    LOG_USER_OPERATE(L"Folder Area", 200, text);
}

bool isCreateNew()
{
    IEditContext* context = IEditContext::instance();
    return context && context->isCreateNew();
}

} // namespace

// --- What a row is --------------------------------------------------------------------------------------

QString FolderPicker::regetRootPath()
{
    if (mRootPath.isEmpty()) {
        mRootPath = mController.getTitlerRootFolder();
        mFactory->setRootPath(mRootPath);
    }
    return mRootPath;
}

QString FolderPicker::folderPath(const QString& name) const
{
    return mRootPath + QLatin1Char('/') + name;
}

bool FolderPicker::checkItemisFolder(const QModelIndex& index) const
{
    return index.isValid() && mModel->isForder(index);
}

// A title stands for its folder.
QModelIndex FolderPicker::folderOf(const QModelIndex& index) const
{
    if (!index.isValid() || checkItemisFolder(index))
        return index.siblingAtColumn(FolderPickerFactory::NameColumn);
    return index.parent();
}

QString FolderPicker::nameOf(const QModelIndex& index) const
{
    return index.siblingAtColumn(FolderPickerFactory::NameColumn).data().toString();
}

// Names that differ in case alone may both be there: the very name goes first.
QModelIndex FolderPicker::getFolderIndex(const QString& name, const QModelIndex& skipped) const
{
    QModelIndex found;
    for (int row = 0; row < mModel->rowCount(); ++row) {
        const QModelIndex index = mModel->index(row, FolderPickerFactory::NameColumn);
        if (index == skipped || !FolderNameRules::isSameName(nameOf(index), name))
            continue;
        if (nameOf(index) == name)
            return index;
        if (!found.isValid())
            found = index;
    }
    return found;
}

bool FolderPicker::checkFolderNameIsExist(const QString& name) const
{
    if (name.isEmpty())
        return false;
    if (mAction == FOLDER_EDIT_RENAME && FolderNameRules::isSameName(name, mOldName))
        return false;
    return getFolderIndex(name, mEditIndex).isValid();
}

bool FolderPicker::checkDiskSpaceIsFull(const QString& path, bool withFolderSize) const
{
    return mController.isDiskFull(path, withFolderSize);
}

bool FolderPicker::checkCanShowTemplate(const QModelIndex& index) const
{
    if (!index.isValid())
        return true;
    const QModelIndex folder = folderOf(index);
    if ((!mModel->hasChildren(folder) || isCreateNew()) &&
        checkDiskSpaceIsFull(folderPath(nameOf(folder)), false)) {
        ListMessages::post(MessageDef::MESSAGE_DISK_FULL_ON_CREATE, tr("File"));
        return false;
    }
    return true;
}

bool FolderPicker::checkCanCreateNew(const QModelIndex& index) const
{
    if (index.isValid() && isCreateNew() && mModel->rowCount(folderOf(index)) == ListMessages::TITLE_LIMIT) {
        ListMessages::post(MessageDef::MESSAGE_FOLDER_EXISTS);
        return false;
    }
    return true;
}

// Folders can go without a word; the row of one that has goes when it is used.
bool FolderPicker::isVanished(const QModelIndex& index)
{
    const QString name = nameOf(folderOf(index));
    if (!index.isValid() || mController.isTitleFolder(mRootPath, name))
        return false;
    slotDeleteFolder(name.toStdWString());
    return true;
}

// --- Attributes of rows ---------------------------------------------------------------------------------

void FolderPicker::setDefauleItemAttribute(const QModelIndex& index, const QString& name)
{
    mFactory->setFolderAttribute(mModel->itemOf(index)->attributes(), name, QFileInfo());
}

void FolderPicker::setAttributeAtDoEdit(const QModelIndex& index, const QString& name)
{
    mFactory->setFolderAttribute(mModel->itemOf(index)->attributes(), name, mFactory->getNewFolderInfo(name));
    setEditable(mCurrentFolderName, false);
    mTree->viewport()->update();
}

void FolderPicker::insertChildrenIndex(const QModelIndex& index, const QString& name)
{
    mModel->setSourceData(index, mFactory->takeFolder(name));
}

void FolderPicker::removeRow(const QModelIndex& index)
{
    if (index.isValid())
        mModel->removeRow(index.row(), index.parent());
}

// --- The tree -------------------------------------------------------------------------------------------

void FolderPicker::pressedFolder(QModelIndex indexPress)
{
    if (!indexPress.isValid())
        return;
    // Opening and closing a folder picks it, so that the buttons act on what was touched last. A title of it
    // that was chosen stays so for as long as it can be seen.
    const QPersistentModelIndex pressed = indexPress.siblingAtColumn(FolderPickerFactory::NameColumn);
    if (folderOf(mTree->currentIndex()) != folderOf(pressed) || isHiddenBy(pressed))
        mTree->setCurrentIndex(pressed);
    mPressedIndex = pressed;
    const QModelIndex current = mTree->currentIndex();
    if (checkItemisFolder(current)) {
        ChangeButtonState(ALL_BUTTONS);
        clearThumbnailArea();
        return;
    }
    ChangeButtonState(NO_DUPLICATE);
    KSModelItem* item = mModel->itemOf(current);
    updateThumbnailArea(mFactory->getNodeInfo(item->dataItem()->getSourceData()).filePath());
}

bool FolderPicker::isHiddenBy(const QModelIndex& folder) const
{
    return mTree->currentIndex().parent() == folder && !mTree->isExpanded(folder);
}

void FolderPicker::slotCurrentChangedByTouch(QModelIndex)
{
    logTap(L"Select Folder or File");
}

void FolderPicker::slotHeaderClicked(int column)
{
    const QString name = mModel->headerData(column, Qt::Horizontal).toString();
    const bool ascending = mTree->header()->sortIndicatorOrder() == Qt::AscendingOrder;
    LOG_USER_OPERATE(L"File List", 200,
                     L"Sort by Column: " + name.toStdWString() +
                         (ascending ? L" in AscendingOrder order" : L" in DescendingOrder order"));
}

void FolderPicker::startEditing(QModelIndex index)
{
    if (mEditing || !index.isValid() || index.column() != FolderPickerFactory::NameColumn ||
        !checkItemisFolder(index) || !index.data(KSVIEW::ItemEditableRole).toBool() || isVanished(index))
        return;
    mOldName = nameOf(index);
    if (openEditor(index, FOLDER_EDIT_RENAME)) {
        if (ITitlerFolderReporter* reporter = ITitlerFolderReporter::instance())
            reporter->renameFolderStartStatus(folderPath(mOldName));
    }
}

// --- The buttons ----------------------------------------------------------------------------------------

void FolderPicker::createFolder()
{
    logTap(L"Tap New Folder Button");
    if (mEditing && renameAction())
        return;
    if (checkDiskSpaceIsFull(regetRootPath(), false)) {
        ListMessages::post(MessageDef::MESSAGE_DISK_FULL_ON_CREATE, tr("folder"));
        return;
    }
    if (addFolderRow(mUntitled, FOLDER_EDIT_CREATE, QModelIndex()))
        ChangeButtonState(ALL_BUTTONS);
}

void FolderPicker::duplicateFolder()
{
    logTap(L"Tap Duplicate Button");
    if (mEditing && renameAction())
        return;
    const QModelIndex source = folderOf(mTree->currentIndex());
    if (!source.isValid() || isVanished(source))
        return;
    const QString name = nameOf(source);
    regetRootPath();
    if (checkDiskSpaceIsFull(folderPath(name), true)) {
        ListMessages::post(MessageDef::MESSAGE_DISK_FULL_ON_DUPLICATE, tr("folder"));
        return;
    }
    mDuplicateSource = folderPath(name);
    addFolderRow(name, FOLDER_EDIT_DUPLICATE, source);
}

bool FolderPicker::addFolderRow(const QString& name, FolderEdit action, const QModelIndex& behind)
{
    const QPersistentModelIndex sibling = behind;
    const int row = mModel->rowCount();
    if (!mTree->insertRows(row, 1, QModelIndex()))
        return false;
    const QModelIndex index = mModel->index(row, FolderPickerFactory::NameColumn);
    setDefauleItemAttribute(index, name);
    mTree->setCurrentIndex(index);
    if (sibling.isValid())
        mTree->moveToSibling(sibling);
    clearThumbnailArea();
    mOldName = name;
    mTree->scrollTo(mTree->currentIndex());
    if (!openEditor(mTree->currentIndex(), action))
        return false;
    mEditor->selectAll();
    return true;
}

void FolderPicker::openFolder()
{
    logTap(L"Tap Open Button");
    if (mEditing && renameAction())
        return;
    const QModelIndex current = mTree->currentIndex().siblingAtColumn(FolderPickerFactory::NameColumn);
    if (!current.isValid() || isVanished(current) || !checkCanShowTemplate(current) ||
        !checkCanCreateNew(current))
        return;
    const QString name = nameOf(folderOf(current));
    mKeepDialog = false;
    if (checkItemisFolder(current)) {
        Q_EMIT changeFolderPath(folderPath(name));
    } else {
        const QFileInfo title = mFactory->getNodeInfo(mModel->itemOf(current)->dataItem()->getSourceData());
        Q_EMIT changeFolderFile(folderPath(name), title.fileName());
    }
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
    cancelEdit();
    done(Rejected);
    Q_EMIT signalCancelClicked();
}

// --- The editor -----------------------------------------------------------------------------------------

bool FolderPicker::openEditor(const QModelIndex& index, FolderEdit action)
{
    mAction = action;
    mEditing = true;
    mCommitted = false;
    mNameValid = true;
    mEditIndex = index;
    mFullName = mOldName;
    mTree->setCurrentIndex(index);
    Q_EMIT mTree->editorEvent(index);
    if (!mEditor) { // the tree refused
        slotEditStateEnd();
        return false;
    }
    callSoftKeyBoard();
    return true;
}

void FolderPicker::slotCreateEditor(FolderEditor* editor)
{
    mEditor = editor;
    connect(editor, &FolderEditor::signalInvalidInput, this, &FolderPicker::slotInvalidInput);
    connect(editor, &FolderEditor::signalLongInput, this, &FolderPicker::slotLongInput);
    connect(editor, &FolderEditor::signalValidInput, this, &FolderPicker::slotValidInput);
    connect(editor, &FolderEditor::signalEditStateEnd, this, &FolderPicker::slotEditStateEnd);
    connect(editor, &FolderEditor::signalPressedEnter, this, &FolderPicker::slotPressedEnter);
    connect(editor, &FolderEditor::signalPressedEscape, this, &FolderPicker::cancelEdit);
    connect(editor, &FolderEditor::signalPressedClose, this, &FolderPicker::slotPressedClose);
    connect(editor, &QLineEdit::textChanged, this, &FolderPicker::slotTextChanged);
}

void FolderPicker::slotTextChanged(QString text)
{
    mFullName = std::move(text);
}

void FolderPicker::callSoftKeyBoard()
{
    if (!mEditor)
        return;
    mEditor->setObjectName(QString::fromLatin1(KEYBOARD_FIELD).arg(tr("Folder Name")));
    mEditor->setFocus();
    KSInputContext* context = KSInputContext::instance();
    if (!context)
        return;
    KSInputContext::resetFocusWidget();
    context->setFocusWidget(mEditor);
    const QEvent request(QEvent::RequestSoftwareInputPanel);
    context->filterEvent(&request);
}

void FolderPicker::showSoftKeyboard()
{
    if (mEditing)
        callSoftKeyBoard();
}

void FolderPicker::slotCloseSoftwareKeyBoardForFileManager()
{
    if (KSInputContext* context = KSInputContext::instance())
        context->closeSoftKeyBoardWindow();
}

void FolderPicker::slotPressedEnter()
{
    if (mNameValid)
        renameAction();
}

// A name that is refused is not left behind.
void FolderPicker::slotPressedClose()
{
    if (mNameValid)
        renameAction();
    else
        callSoftKeyBoard();
}

void FolderPicker::showLimit(const QString& text, int code)
{
    if (KSInputContext* context = KSInputContext::instance())
        context->showLimitInfo({text.toStdWString(), std::wstring(), code});
}

void FolderPicker::slotInvalidInput()
{
    mNameValid = false;
    showLimit(tr("The following characters cannot be entered.\n\\ / : , ; * ? \" < > | [ ] = ."),
              LIMIT_CHARACTERS);
}

void FolderPicker::slotLongInput()
{
    mNameValid = false;
    showLimit(tr("You can only enter up to 20 characters."), LIMIT_LENGTH);
}

void FolderPicker::slotValidInput()
{
    showLimit(QString(), LIMIT_NONE);
    mNameValid = true;
}

bool FolderPicker::renameAction()
{
    if (!mEditor)
        return false;
    if (mMessageUp)
        return true;
    if (mEditor->text().isEmpty())
        mEditor->setText(mOldName);
    const QString name = mEditor->text();
    if (!checkFolderNameIsExist(name)) {
        mTree->closeEditorState(mEditor, QAbstractItemDelegate::NoHint);
        return false;
    }
    mEditor->undo();
    slotCloseSoftwareKeyBoardForFileManager();
    mMessageUp = MessageBoxController::getInstance() != nullptr;
    ListMessages::post(MessageDef::MESSAGE_RENAME_FAILED, name);
    return true;
}

void FolderPicker::reCallcallSoftKeyBoard(MessageDefine::tagCloseParam param)
{
    if (param.messageId != MessageDef::MESSAGE_RENAME_FAILED || !mMessageUp)
        return;
    mMessageUp = false;
    callSoftKeyBoard();
}

void FolderPicker::cancelEdit()
{
    if (mEditor)
        mTree->closeEditorState(mEditor, QAbstractItemDelegate::RevertModelCache);
}

void FolderPicker::slotEditStateEnd()
{
    const FolderEdit action = mAction;
    const QModelIndex index = mEditIndex;
    mFactory->slotReleaseEditor();
    mEditor = nullptr;
    mEditing = false;
    mAction = FOLDER_EDIT_NONE;
    mEditIndex = QModelIndex();
    if (KSInputContext* context = KSInputContext::instance();
        context && !KSInputContext::isSoftKeyboardClosed())
        context->closeSoftKeyBoardWindow();
    if (mCommitted)
        return;
    if (action == FOLDER_EDIT_RENAME) {
        ITitlerFolderReporter* reporter = ITitlerFolderReporter::instance();
        if (reporter && QFileInfo(folderPath(mOldName)).isDir())
            reporter->changeTitlerFolderName(folderPath(mOldName), folderPath(mOldName));
    } else if (action != FOLDER_EDIT_NONE) {
        // The tree is still at its editor; the row of a folder that nobody made goes after that.
        const QString source =
            action == FOLDER_EDIT_DUPLICATE ? QFileInfo(mDuplicateSource).fileName() : QString();
        const QPersistentModelIndex row = index;
        QMetaObject::invokeMethod(
            this, [this, row, source] { dropUnmadeFolder(row, source); }, Qt::QueuedConnection);
    }
}

// What was selected before is again.
void FolderPicker::dropUnmadeFolder(const QPersistentModelIndex& row, const QString& source)
{
    if (!row.isValid())
        return;
    const QPersistentModelIndex before = source.isEmpty() ? QModelIndex() : getFolderIndex(source, row);
    removeRow(row);
    mTree->setCurrentIndex(before);
    clearThumbnailArea();
    if (isVisible())
        ChangeButtonState(before.isValid() ? ALL_BUTTONS : NEW_FOLDER_AND_CANCEL);
}

// --- What becomes of a name -----------------------------------------------------------------------------

void FolderPicker::doEdit(const QString& name, const QModelIndex& index)
{
    if (name.isEmpty() || !index.isValid())
        return;
    mCommitted = true;
    bool made = false;
    const FolderEdit action = mAction;
    switch (mAction) {
    case FOLDER_EDIT_RENAME:
        doRename(name, index);
        break;
    case FOLDER_EDIT_DUPLICATE:
        made = mController.duplicateFolder(mRootPath, mDuplicateSource, name);
        setAttributeAtDoEdit(index, name);
        insertChildrenIndex(index, name);
        break;
    case FOLDER_EDIT_CREATE:
        made = mController.createFolder(mRootPath, name);
        setAttributeAtDoEdit(index, name);
        insertChildrenIndex(index, name);
        break;
    case FOLDER_EDIT_NONE:
        return;
    }
    if (action != FOLDER_EDIT_RENAME && !QFileInfo(folderPath(name)).isDir()) {
        mCommitted = false; // its row goes with the editor
        ListMessages::post(action == FOLDER_EDIT_DUPLICATE ? MessageDef::MESSAGE_DISK_FULL_ON_DUPLICATE
                                                           : MessageDef::MESSAGE_DISK_FULL_ON_CREATE,
                           tr("folder"));
    }
    canSendSignal(name, made);
    mTree->viewport()->update();
}

void FolderPicker::doRename(const QString& name, const QModelIndex& index)
{
    // A rename that the disk refuses leaves the row under the name that the folder has.
    const bool renamed = mController.renameFolder(mRootPath, mOldName, name);
    const QString now = renamed ? name : mOldName;
    if (renamed) {
        Q_EMIT folderMoved(folderPath(mOldName), folderPath(name));
        mFactory->renameFolder(mOldName, name);
        insertChildrenIndex(index, name);
    } else if (name != mOldName) {
        if (QFileInfo::exists(folderPath(name))) // made by others meanwhile
            ListMessages::post(MessageDef::MESSAGE_RENAME_FAILED, name);
        else
            ListMessages::post(MessageDef::MESSAGE_DISK_FULL_ON_CREATE, tr("folder"));
    }
    setAttributeAtDoEdit(index, now);
    if (ITitlerFolderReporter* reporter = ITitlerFolderReporter::instance())
        reporter->changeTitlerFolderName(folderPath(mOldName), folderPath(now));
}

void FolderPicker::canSendSignal(const QString& name, bool flag) const
{
    ITitleChangeReporter* reporter = ITitleChangeReporter::instance();
    if (flag && reporter)
        reporter->changeTitlerStatus(FileManagerDefine::TITLE_ADDED, folderPath(name));
}
