// How the folder picker follows what other processes do to folders, and which folder is open.
#include "library/FolderEditor.h"
#include "library/FolderNameRules.h"
#include "library/FolderPicker.h"
#include "library/FolderPickerFactory.h"
#include "support/ConfinedPath.h"
#include "support/RefusedWrites.h"
#include "touchui/KSInputContext.h"
#include "touchui/KSModelAttributeItem.h"
#include "touchui/KSPushbutton.h"
#include "touchui/KSTreeModel.h"
#include "touchui/KSTreeView.h"
#include "touchui/KSVIEW.h"

namespace
{

QString plainName(const std::wstring& nameOrPath)
{
    return QString::fromStdWString(nameOrPath).section(QLatin1Char('/'), -1, -1, QString::SectionSkipEmpty);
}

} // namespace

void FolderPicker::setEditable(const QString& name, bool editable)
{
    const QModelIndex index = name.isEmpty() ? QModelIndex() : getFolderIndex(name);
    KSModelItem* item = mModel->itemOf(index);
    if (!item)
        return;
    item->attributes()->setAttribute(KSVIEW::ItemEditableRole, editable, FolderPickerFactory::NameColumn);
    item->attributes()->setAttribute(KSVIEW::ItemEditableRole, false, FolderPickerFactory::DateColumn);
}

void FolderPicker::setCurrentFolderName(const QString& name)
{
    setEditable(mCurrentFolderName, true);
    mCurrentFolderName = name;
    setEditable(mCurrentFolderName, false);
}

void FolderPicker::updateTreeView()
{
    cancelEdit();
    mRootPath.clear();
    regetRootPath();
    mModel->createDataItems();
    mTree->scrollToTop();
    clearThumbnailArea();
    mButtons[DuplicateButton]->setEnabled(false);
    mButtons[OpenButton]->setEnabled(false);
    setEditable(mCurrentFolderName, false);
}

// The name may come in another case, except where it is the very name of another folder.
bool FolderPicker::isNameOf(const QString& name, const QString& folder) const
{
    if (folder.isEmpty() || !FolderNameRules::isSameName(name, folder))
        return false;
    return name == folder || nameOf(getFolderIndex(name)) != name;
}

void FolderPicker::folderNameChanged(FileManagerDefine::tagChangeFolderNameParam param)
{
    const QString before = plainName(param.oldPath);
    const QString after = plainName(param.newPath);
    if (!FolderNameRules::isFolderName(before) || !FolderNameRules::isFolderName(after))
        return;
    regetRootPath();
    if (!mController.staysBelow(mRootPath, after)) {
        ConfinedPath::logRefusal(L"a folder is said to be called like a link: ",
                                 folderPath(after).toStdString());
        return;
    }
    Q_EMIT folderMoved(folderPath(before), folderPath(after));
    if (isNameOf(before, mCurrentFolderName)) {
        mCurrentFolderName = after;
        Q_EMIT folderNameChange(folderPath(before), folderPath(after));
        // The steps back speak of the old path, also that of a text that was just being typed.
        Q_EMIT clearUndoCommandStack();
    }
    if (!isVisible())
        return;
    if (mAction == FOLDER_EDIT_DUPLICATE && mDuplicateSource == folderPath(before))
        mDuplicateSource = folderPath(after);
    mFactory->renameFolder(before, after);
    if (mAction == FOLDER_EDIT_RENAME && isNameOf(before, mOldName)) {
        continuefolderNameChanged(after);
        return;
    }
    const QModelIndex index = getFolderIndex(before, mEditIndex);
    if (index.isValid()) {
        setAttributeAtDoEdit(index, after);
        insertChildrenIndex(index, after);
    }
    mFactory->importSourceData();
    mTree->viewport()->update();
}

// The name under the operator's hands has changed: the edit goes on from the new one.
void FolderPicker::continuefolderNameChanged(QString after)
{
    const QModelIndex index = mEditIndex;
    if (!mEditor || !index.isValid())
        return;
    mOldName = after;
    setAttributeAtDoEdit(index, after);
    insertChildrenIndex(index, after);
    mEditor->setText(after);
    slotCloseSoftwareKeyBoardForFileManager();
    callSoftKeyBoard();
}

void FolderPicker::slotDeleteFolder(std::wstring name)
{
    const QString folder = plainName(name);
    if (FolderNameRules::isFolderName(folder) && !QFileInfo::exists(folderPath(folder)))
        RefusedWrites::forgetFolder(
            folderPath(folder).toStdString()); // what could not be saved is not wanted
    if (isNameOf(folder, mCurrentFolderName))
        setCurrentFolderName(QString());
    // A folder that is only being made is none yet.
    const bool isMade = mAction != FOLDER_EDIT_CREATE && mAction != FOLDER_EDIT_DUPLICATE;
    const QModelIndex index = getFolderIndex(folder, isMade ? QModelIndex() : QModelIndex(mEditIndex));
    if (!index.isValid())
        return;
    const QModelIndex current = folderOf(mTree->currentIndex());
    if (isVisible() && current.isValid() && current == index) {
        ChangeButtonState(NEW_FOLDER_AND_CANCEL);
        mTree->setCurrentIndex(QModelIndex());
        clearThumbnailArea();
    }
    removeRow(index);
}
