#include "library/FolderNameEdit.h"

#include "canvas/MessageBoxController.h"
#include "document/ITitleChangeReporter.h"
#include "library/FolderEditor.h"
#include "library/FolderNameRules.h"
#include "library/FolderPickerFactory.h"
#include "library/FolderRows.h"
#include "library/ITitlerFolderReporter.h"
#include "library/ListMessages.h"
#include "touchui/CustomTreeDelegete.h"
#include "touchui/KSInputContext.h"
#include "touchui/KSTreeModel.h"
#include "touchui/KSTreeView.h"
#include "touchui/KSVIEW.h"

#include <QCoreApplication>
#include <QEvent>
#include <QFileInfo>

namespace
{

// "<keyboard type>#<title>#<selection mode>#<last value>"
const char KEYBOARD_FIELD[] = "2#%1#0#2";

const int LIMIT_NONE = 0;
const int LIMIT_CHARACTERS = 4001;
const int LIMIT_LENGTH = 4002;

} // namespace

FolderNameEdit::FolderNameEdit(FolderRows* rows, KSTreeView* tree, QObject* parent)
    : QObject(parent), m_rows(rows), m_tree(tree)
{
    connect(m_tree->treeDelegate(), &CustomTreeDelegete::signalLineEditCommitted, this,
            &FolderNameEdit::doEdit);
    connect(m_rows->factory(), &FolderPickerFactory::signalCreateEditor, this,
            &FolderNameEdit::slotCreateEditor);
}

FolderEditor* FolderNameEdit::editor() const
{
    return m_editor;
}

QModelIndex FolderNameEdit::unmadeRow() const
{
    const bool isMade = m_action != FOLDER_EDIT_CREATE && m_action != FOLDER_EDIT_DUPLICATE;
    return isMade ? QModelIndex() : QModelIndex(m_row);
}

// --- Beginning ------------------------------------------------------------------------------------------

void FolderNameEdit::startRename(const QModelIndex& index)
{
    m_oldName = m_rows->nameOf(index);
    if (!openEditor(index, FOLDER_EDIT_RENAME))
        return;
    if (ITitlerFolderReporter* reporter = ITitlerFolderReporter::instance())
        reporter->renameFolderStartStatus(m_rows->folderPath(m_oldName));
}

bool FolderNameEdit::startCreate(const QString& name)
{
    return addFolderRow(name, FOLDER_EDIT_CREATE, QModelIndex());
}

bool FolderNameEdit::startDuplicate(const QString& source, const QModelIndex& sourceRow)
{
    m_duplicateSource = m_rows->folderPath(source);
    return addFolderRow(source, FOLDER_EDIT_DUPLICATE, sourceRow);
}

bool FolderNameEdit::addFolderRow(const QString& name, FolderEdit action, const QModelIndex& behind)
{
    const QPersistentModelIndex sibling = behind;
    const int last = m_rows->model()->rowCount();
    if (!m_tree->insertRows(last, 1, QModelIndex()))
        return false;
    const QModelIndex index = m_rows->model()->index(last, FolderPickerFactory::NameColumn);
    m_rows->setDefauleItemAttribute(index, name);
    m_tree->setCurrentIndex(index);
    if (sibling.isValid())
        m_tree->moveToSibling(sibling);
    Q_EMIT rowAdded();
    m_oldName = name;
    m_tree->scrollTo(m_tree->currentIndex());
    if (!openEditor(m_tree->currentIndex(), action))
        return false;
    m_editor->selectAll();
    return true;
}

bool FolderNameEdit::openEditor(const QModelIndex& index, FolderEdit action)
{
    m_action = action;
    m_committed = false;
    m_nameValid = true;
    m_row = index;
    m_tree->setCurrentIndex(index);
    Q_EMIT m_tree->editorEvent(index);
    if (!m_editor) { // the tree did not open an editor
        slotEditStateEnd();
        return false;
    }
    callSoftKeyBoard();
    return true;
}

void FolderNameEdit::slotCreateEditor(FolderEditor* editor)
{
    m_editor = editor;
    connect(editor, &FolderEditor::signalInvalidInput, this, &FolderNameEdit::slotInvalidInput);
    connect(editor, &FolderEditor::signalLongInput, this, &FolderNameEdit::slotLongInput);
    connect(editor, &FolderEditor::signalValidInput, this, &FolderNameEdit::slotValidInput);
    connect(editor, &FolderEditor::signalEditStateEnd, this, &FolderNameEdit::slotEditStateEnd);
    connect(editor, &FolderEditor::signalPressedEnter, this, &FolderNameEdit::slotPressedEnter);
    connect(editor, &FolderEditor::signalPressedEscape, this, &FolderNameEdit::cancelEdit);
    connect(editor, &FolderEditor::signalPressedClose, this, &FolderNameEdit::slotPressedClose);
}

void FolderNameEdit::callSoftKeyBoard()
{
    if (!m_editor)
        return;
    m_editor->setObjectName(
        QString::fromLatin1(KEYBOARD_FIELD).arg(QCoreApplication::translate("FolderPicker", "Folder Name")));
    m_editor->setFocus();
    KSInputContext* context = KSInputContext::instance();
    if (!context)
        return;
    KSInputContext::resetFocusWidget();
    context->setFocusWidget(m_editor);
    const QEvent request(QEvent::RequestSoftwareInputPanel);
    context->filterEvent(&request);
}

void FolderNameEdit::closeSoftKeyBoard()
{
    if (KSInputContext* context = KSInputContext::instance())
        context->closeSoftKeyBoardWindow();
}

// --- Typing ---------------------------------------------------------------------------------------------

void FolderNameEdit::slotPressedEnter()
{
    if (m_nameValid)
        renameAction();
}

// Keeps the field open while its name is refused.
void FolderNameEdit::slotPressedClose()
{
    if (m_nameValid)
        renameAction();
    else
        callSoftKeyBoard();
}

void FolderNameEdit::showLimit(const QString& text, int code)
{
    if (KSInputContext* context = KSInputContext::instance())
        context->showLimitInfo({text.toStdWString(), std::wstring(), code});
}

void FolderNameEdit::slotInvalidInput()
{
    m_nameValid = false;
    showLimit(
        QCoreApplication::translate(
            "FolderPicker", "The following characters cannot be entered.\n\\ / : , ; * ? \" < > | [ ] = ."),
        LIMIT_CHARACTERS);
}

void FolderNameEdit::slotLongInput()
{
    m_nameValid = false;
    showLimit(QCoreApplication::translate("FolderPicker", "You can only enter up to 20 characters."),
              LIMIT_LENGTH);
}

void FolderNameEdit::slotValidInput()
{
    showLimit(QString(), LIMIT_NONE);
    m_nameValid = true;
}

// --- The end --------------------------------------------------------------------------------------------

bool FolderNameEdit::checkFolderNameIsExist(const QString& name) const
{
    if (name.isEmpty())
        return false;
    if (m_action == FOLDER_EDIT_RENAME && FolderNameRules::isSameName(name, m_oldName))
        return false;
    return m_rows->getFolderIndex(name, m_row).isValid();
}

bool FolderNameEdit::renameAction()
{
    if (!m_editor)
        return false;
    if (m_messageUp)
        return true;
    if (m_editor->text().isEmpty())
        m_editor->setText(m_oldName);
    const QString name = m_editor->text();
    if (!checkFolderNameIsExist(name)) {
        m_tree->closeEditorState(m_editor, QAbstractItemDelegate::NoHint);
        return false;
    }
    m_editor->undo();
    closeSoftKeyBoard();
    m_messageUp = MessageBoxController::getInstance() != nullptr;
    ListMessages::post(MessageDef::MESSAGE_RENAME_FAILED, name);
    return true;
}

void FolderNameEdit::messageClosed(MessageDefine::tagCloseParam param)
{
    if (param.messageId != MessageDef::MESSAGE_RENAME_FAILED || !m_messageUp)
        return;
    m_messageUp = false;
    callSoftKeyBoard();
}

void FolderNameEdit::cancelEdit()
{
    if (m_editor)
        m_tree->closeEditorState(m_editor, QAbstractItemDelegate::RevertModelCache);
}

void FolderNameEdit::slotEditStateEnd()
{
    const FolderEdit action = m_action;
    const QModelIndex index = m_row;
    m_rows->factory()->slotReleaseEditor();
    m_editor = nullptr;
    m_action = FOLDER_EDIT_NONE;
    m_row = QModelIndex();
    if (KSInputContext* context = KSInputContext::instance();
        context && !KSInputContext::isSoftKeyboardClosed())
        context->closeSoftKeyBoardWindow();
    if (m_committed)
        return;
    if (action == FOLDER_EDIT_RENAME) {
        ITitlerFolderReporter* reporter = ITitlerFolderReporter::instance();
        if (reporter && QFileInfo(m_rows->folderPath(m_oldName)).isDir())
            reporter->changeTitlerFolderName(m_rows->folderPath(m_oldName), m_rows->folderPath(m_oldName));
    } else if (action != FOLDER_EDIT_NONE) {
        // The tree is still closing its editor, so the row of a folder that was not created is removed later.
        const QString source =
            action == FOLDER_EDIT_DUPLICATE ? QFileInfo(m_duplicateSource).fileName() : QString();
        const QPersistentModelIndex row = index;
        QMetaObject::invokeMethod(
            this, [this, row, source] { dropUnmadeRow(row, source); }, Qt::QueuedConnection);
    }
}

// Removes the row and makes the row that was current before current again.
void FolderNameEdit::dropUnmadeRow(const QPersistentModelIndex& row, const QString& source)
{
    if (!row.isValid())
        return;
    const QPersistentModelIndex before =
        source.isEmpty() ? QModelIndex() : m_rows->getFolderIndex(source, row);
    m_rows->remove(row);
    m_tree->setCurrentIndex(before);
    Q_EMIT unmadeRowDropped(before.isValid());
}

// --- What becomes of a name -----------------------------------------------------------------------------

void FolderNameEdit::doEdit(const QString& name, const QModelIndex& index)
{
    if (name.isEmpty() || !index.isValid() || !isActive())
        return;
    m_committed = true;
    bool made = false;
    if (m_action == FOLDER_EDIT_RENAME)
        doRename(name, index);
    else
        made = makeFolder(name, index);
    canSendSignal(name, made);
    m_tree->viewport()->update();
}

bool FolderNameEdit::makeFolder(const QString& name, const QModelIndex& index)
{
    const bool isCopy = m_action == FOLDER_EDIT_DUPLICATE;
    const QString root = m_rows->regetRootPath();
    const QString path = m_rows->folderPath(name);
    const bool existed = QFileInfo(path).isDir(); // created by another process meanwhile
    const bool made = isCopy ? m_rows->disk().duplicateFolder(root, m_duplicateSource, name)
                             : m_rows->disk().createFolder(root, name);
    setRow(index, name);
    m_rows->insertChildrenIndex(index, name);
    const bool exists = QFileInfo(path).isDir();
    if (!exists)
        m_committed = false; // the row is removed when the editor is closed
    // A disk that refuses everything also refuses the removal of a partial copy.
    if (!exists || (!made && !existed))
        ListMessages::post(isCopy ? MessageDef::MESSAGE_DISK_FULL_ON_DUPLICATE
                                  : MessageDef::MESSAGE_DISK_FULL_ON_CREATE,
                           QCoreApplication::translate("FolderPicker", "folder"));
    return made;
}

void FolderNameEdit::doRename(const QString& name, const QModelIndex& index)
{
    // When the disk refuses the rename, the row keeps the old name.
    const bool renamed = m_rows->disk().renameFolder(m_rows->regetRootPath(), m_oldName, name);
    const QString now = renamed ? name : m_oldName;
    if (renamed) {
        Q_EMIT folderMoved(m_rows->folderPath(m_oldName), m_rows->folderPath(name));
        m_rows->factory()->renameFolder(m_oldName, name);
        m_rows->insertChildrenIndex(index, name);
    } else if (name != m_oldName) {
        if (QFileInfo::exists(m_rows->folderPath(name))) // created by another process meanwhile
            ListMessages::post(MessageDef::MESSAGE_RENAME_FAILED, name);
        else
            ListMessages::post(MessageDef::MESSAGE_DISK_FULL_ON_CREATE,
                               QCoreApplication::translate("FolderPicker", "folder"));
    }
    setRow(index, now);
    if (ITitlerFolderReporter* reporter = ITitlerFolderReporter::instance())
        reporter->changeTitlerFolderName(m_rows->folderPath(m_oldName), m_rows->folderPath(now));
}

void FolderNameEdit::setRow(const QModelIndex& index, const QString& name)
{
    m_rows->setAttributeAtDoEdit(index, name);
    m_tree->viewport()->update();
}

void FolderNameEdit::canSendSignal(const QString& name, bool flag) const
{
    ITitleChangeReporter* reporter = ITitleChangeReporter::instance();
    if (flag && reporter)
        reporter->changeTitlerStatus(FileManagerDefine::TITLE_ADDED, m_rows->folderPath(name));
}

// --- Renames by others ----------------------------------------------------------------------------------

void FolderNameEdit::sourceRenamed(const QString& before, const QString& after)
{
    if (m_action == FOLDER_EDIT_DUPLICATE && m_duplicateSource == m_rows->folderPath(before))
        m_duplicateSource = m_rows->folderPath(after);
}

bool FolderNameEdit::isRenaming(const QString& name) const
{
    return m_action == FOLDER_EDIT_RENAME && m_rows->isNameOf(name, m_oldName);
}

void FolderNameEdit::goOnFrom(const QString& name)
{
    const QModelIndex index = m_row;
    if (!m_editor || !index.isValid())
        return;
    m_oldName = name;
    setRow(index, name);
    m_rows->insertChildrenIndex(index, name);
    m_editor->setText(name);
    closeSoftKeyBoard();
    callSoftKeyBoard();
}
