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
    , m_rows(this)
    , m_masks(this, FRAME)
    , m_separator(QStringLiteral(":/Separator_H"))
{
    setObjectName(QStringLiteral("FolderPickerWindow"));
    setStyleSheet(QStringLiteral("QDialog#FolderPickerWindow {font-size:24px; background:rgb(50, 50, 50);}"));
    setAttribute(Qt::WA_AcceptTouchEvents);
    setFixedSize(FOLDER_PICKER_SIZE);
    new WindowPlaceKeeper(this); // owned by this dialog
    createTree();
    m_edit = std::make_unique<FolderNameEdit>(&m_rows, m_tree, nullptr);
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
    const QPointer<FolderEditor> editor = m_edit->editor();
    m_edit->cancelEdit();
    delete editor;
    m_tree->disconnect(this);
    delete m_tree;
}

void FolderPicker::createTree()
{
    const int between =
        STARTPOINT_OF_BOTTOM_HSEPARATOR.y() - STARTPOINT_OF_TOP_HSEPARATOR.y() - SEPARATOR_HEIGHT;
    const QPoint place(FOLDER_PICKER_SIZE.width() - SIDE_MARGIN - FOLDER_TREEVIEW_SIZE.width(),
                       STARTPOINT_OF_TOP_HSEPARATOR.y() + SEPARATOR_HEIGHT +
                           (between - FOLDER_TREEVIEW_SIZE.height()) / 2);
    m_tree = new KSTreeView(this);
    m_tree->setObjectName(QStringLiteral("folderTree"));
    m_tree->setGeometry(QRect(place, FOLDER_TREEVIEW_SIZE));
    m_tree->setModel(m_rows.model());
    m_tree->setCheckBoxVisible(false);
    m_tree->setSortingEnabled(true);
    m_tree->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    // Otherwise the columns would change their width.
    m_tree->setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOn);
    m_tree->header()->setStretchLastSection(false);
    m_tree->header()->setSectionResizeMode(FolderPickerFactory::NameColumn, QHeaderView::Stretch);
    m_tree->header()->setSectionResizeMode(FolderPickerFactory::DateColumn, QHeaderView::Fixed);
    m_tree->header()->resizeSection(FolderPickerFactory::DateColumn, DATE_WIDTH);
}

void FolderPicker::createDetails()
{
    m_title =
        TitlePreview::createLabel(this,
                                  QRect(2 * FRAME_MARGIN, FRAME_MARGIN, HSEPARATOR_LENGTH - 2 * FRAME_MARGIN,
                                        STARTPOINT_OF_TOP_HSEPARATOR.y() - FRAME_MARGIN),
                                  "folderPickerTitle");
    const int left = FRAME_MARGIN + (m_tree->x() - FRAME_MARGIN - LEFT_WIDTH) / 2;
    m_preview = std::make_unique<TitlePreview>(this, QPoint(left, m_tree->y()));
}

void FolderPicker::createButtons()
{
    const char* names[] = {"duplicateFolderButton", "newFolderButton", "openFolderButton",
                           "cancelFolderButton"};
    const int right = m_tree->geometry().right() + 1;
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
        m_buttons[id] = button;
    }
    connect(m_buttons[DuplicateButton], &QAbstractButton::clicked, this, &FolderPicker::duplicateFolder);
    connect(m_buttons[CreateButton], &QAbstractButton::clicked, this, &FolderPicker::createFolder);
    connect(m_buttons[OpenButton], &QAbstractButton::clicked, this, &FolderPicker::openFolder);
    connect(m_buttons[CancelButton], &QAbstractButton::clicked, this, &FolderPicker::cancelFolder);
}

void FolderPicker::connectTree()
{
    connect(m_tree, &QAbstractItemView::pressed, this, &FolderPicker::pressedFolder);
    connect(m_tree, &QTreeView::collapsed, this, &FolderPicker::pressedFolder);
    connect(m_tree, &QTreeView::expanded, this, &FolderPicker::pressedFolder);
    connect(m_tree->touch(), &TreeTouch::currentChangedByTouch, this,
            &FolderPicker::slotCurrentChangedByTouch);
    connect(m_tree->touch(), &TreeTouch::pressedAndHeld, this, &FolderPicker::startEditing);
    connect(m_tree->header(), &QHeaderView::sectionClicked, this, &FolderPicker::slotHeaderClicked);
    connect(m_edit.get(), &FolderNameEdit::folderMoved, this, &FolderPicker::folderMoved);
    connect(m_edit.get(), &FolderNameEdit::rowAdded, this, [this] { m_preview->clearThumbnailArea(); });
    connect(m_edit.get(), &FolderNameEdit::unmadeRowDropped, this, [this](bool isFolderCurrent) {
        m_preview->clearThumbnailArea();
        if (isVisible())
            ChangeButtonState(isFolderCurrent ? ALL_BUTTONS : NEW_FOLDER_AND_CANCEL);
    });
    for (QObject* object : std::initializer_list<QObject*>{m_tree, m_tree->viewport(), m_tree->header(),
                                                           m_tree->header()->viewport()})
        object->installEventFilter(this);
}

void FolderPicker::ChangeButtonState(folderButtonState state)
{
    const bool none = state == NO_BUTTONS;
    m_buttons[DuplicateButton]->setEnabled(!none && state != NO_DUPLICATE && state != OPEN_AND_CANCEL &&
                                           state != NEW_FOLDER_AND_CANCEL);
    m_buttons[CreateButton]->setEnabled(!none && state != OPEN_AND_CANCEL);
    m_buttons[OpenButton]->setEnabled(!none && state != NEW_FOLDER_AND_CANCEL);
    m_buttons[CancelButton]->setEnabled(!none);
}

void FolderPicker::setDuplicateButtonEnabled(bool enabled)
{
    m_buttons[DuplicateButton]->setEnabled(enabled);
}

void FolderPicker::setCreateFolderButtonEnabled(bool enabled)
{
    m_buttons[CreateButton]->setEnabled(enabled);
}

void FolderPicker::setCancelButtonEnabled(bool enabled)
{
    m_buttons[CancelButton]->setEnabled(enabled);
}

void FolderPicker::setSystemLanFont(QFont font)
{
    font.setPixelSize(TITLE_FONT_SIZE);
    m_title->setFont(font);
    font.setPixelSize(FONT_SIZE);
    m_preview->setFont(font);
    for (KSPushbutton* button : m_buttons)
        button->setFont(font);
    m_tree->header()->setFont(font);
    m_rows.factory()->setItemFont(font);
    m_rows.model()->setAttributeOfAll(Qt::FontRole, font);
}

void FolderPicker::translateText()
{
    m_title->setText(tr("Select Folder"));
    m_untitled = tr("Untitled");
    m_buttons[DuplicateButton]->setText(tr("Duplicate"));
    m_buttons[CreateButton]->setText(tr("New Folder"));
    m_buttons[OpenButton]->setText(tr("Open"));
    m_buttons[CancelButton]->setText(tr("Cancel"));
    m_rows.model()->setHeaderData(FolderPickerFactory::NameColumn, Qt::Horizontal, tr("Name"));
    m_rows.model()->setHeaderData(FolderPickerFactory::DateColumn, Qt::Horizontal, tr("Date"));
}

void FolderPicker::showOpacityWidget(bool show)
{
    if (m_opacity == nullptr)
        m_opacity = DialogMasks::createMask(this, rect());
    m_opacity->raise();
    m_opacity->setVisible(show);
}

void FolderPicker::updateTreeView()
{
    m_edit->cancelEdit();
    m_rows.reload();
    m_tree->scrollToTop();
    m_preview->clearThumbnailArea();
    m_buttons[DuplicateButton]->setEnabled(false);
    m_buttons[OpenButton]->setEnabled(false);
}

// --- The tree -------------------------------------------------------------------------------------------

void FolderPicker::pressedFolder(QModelIndex indexPress)
{
    if (!indexPress.isValid())
        return;
    // Expanding or collapsing a folder selects it, so that the buttons act on what was touched last. A
    // selected title of the folder stays selected while it is visible.
    const QPersistentModelIndex pressed = indexPress.siblingAtColumn(FolderPickerFactory::NameColumn);
    if (m_rows.folderOf(m_tree->currentIndex()) != m_rows.folderOf(pressed) ||
        isCurrentHiddenBy(*m_tree, pressed))
        m_tree->setCurrentIndex(pressed);
    const QModelIndex current = m_tree->currentIndex();
    if (m_rows.checkItemisFolder(current)) {
        ChangeButtonState(ALL_BUTTONS);
        m_preview->clearThumbnailArea();
        return;
    }
    ChangeButtonState(NO_DUPLICATE);
    m_preview->updateThumbnailArea(m_rows.titleFile(current).filePath());
}

void FolderPicker::slotCurrentChangedByTouch(QModelIndex)
{
    logTap(L"Select Folder or File");
}

void FolderPicker::slotHeaderClicked(int column)
{
    const QString name = m_rows.model()->headerData(column, Qt::Horizontal).toString();
    const bool ascending = m_tree->header()->sortIndicatorOrder() == Qt::AscendingOrder;
    LOG_USER_OPERATE(L"File List", 200,
                     L"Sort by Column: " + name.toStdWString() +
                         (ascending ? L" in AscendingOrder order" : L" in DescendingOrder order"));
}

void FolderPicker::startEditing(QModelIndex index)
{
    if (m_edit->isActive() || !index.isValid() || index.column() != FolderPickerFactory::NameColumn ||
        !m_rows.checkItemisFolder(index) || !index.data(KSVIEW::ItemEditableRole).toBool() ||
        isVanished(index))
        return;
    m_edit->startRename(index);
}

// Returns whether the folder was deleted without a notice by another process, and removes its row then.
bool FolderPicker::isVanished(const QModelIndex& index)
{
    const QString name = m_rows.nameOf(m_rows.folderOf(index));
    if (!index.isValid() || m_rows.disk().isTitleFolder(m_rows.regetRootPath(), name))
        return false;
    slotDeleteFolder(name.toStdWString());
    return true;
}

void FolderPicker::showSoftKeyboard()
{
    if (m_edit->isActive())
        m_edit->callSoftKeyBoard();
}

// --- The buttons ----------------------------------------------------------------------------------------

// Ends the edit of a name before another action. Returns true when the edit has to continue.
bool FolderPicker::isEditKept()
{
    return m_edit->isActive() && m_edit->renameAction();
}

void FolderPicker::createFolder()
{
    logTap(L"Tap New Folder Button");
    if (isEditKept())
        return;
    if (m_rows.disk().isDiskFull(m_rows.regetRootPath(), false)) {
        ListMessages::post(MessageDef::MESSAGE_DISK_FULL_ON_CREATE, tr("folder"));
        return;
    }
    if (m_edit->startCreate(m_untitled))
        ChangeButtonState(ALL_BUTTONS);
}

void FolderPicker::duplicateFolder()
{
    logTap(L"Tap Duplicate Button");
    if (isEditKept())
        return;
    const QModelIndex source = m_rows.folderOf(m_tree->currentIndex());
    if (!source.isValid() || isVanished(source))
        return;
    const QString name = m_rows.nameOf(source);
    m_rows.regetRootPath();
    if (m_rows.disk().isDiskFull(m_rows.folderPath(name), true)) {
        ListMessages::post(MessageDef::MESSAGE_DISK_FULL_ON_DUPLICATE, tr("folder"));
        return;
    }
    m_edit->startDuplicate(name, source);
}

void FolderPicker::openFolder()
{
    logTap(L"Tap Open Button");
    if (isEditKept())
        return;
    const QModelIndex current = m_tree->currentIndex().siblingAtColumn(FolderPickerFactory::NameColumn);
    if (!current.isValid() || isVanished(current) || !checkCanShowTemplate(m_rows, current) ||
        !checkCanCreateNew(m_rows, current))
        return;
    const QString name = m_rows.nameOf(m_rows.folderOf(current));
    m_keepDialog = false;
    if (m_rows.checkItemisFolder(current))
        Q_EMIT changeFolderPath(m_rows.folderPath(name));
    else
        Q_EMIT changeFolderFile(m_rows.folderPath(name), m_rows.titleFile(current).fileName());
    setCurrentFolderName(name);
    if (m_keepDialog) {
        m_keepDialog = false;
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
    m_edit->cancelEdit();
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
    const QString oldPath = m_rows.regetRootPath() + QLatin1Char('/') + before;
    const QString newPath = m_rows.folderPath(after);
    if (!m_rows.disk().staysBelow(m_rows.regetRootPath(), after)) {
        ConfinedPath::logRefusal(L"a folder is said to be called like a link: ", newPath.toStdString());
        return;
    }
    Q_EMIT folderMoved(oldPath, newPath);
    if (m_rows.isNameOf(before, currentFolderName())) {
        m_rows.openFolderRenamed(after);
        Q_EMIT folderNameChange(oldPath, newPath);
        // The undo steps, including that of text just being typed, contain the old path.
        Q_EMIT clearUndoCommandStack();
    }
    if (isVisible())
        renameRow(before, after);
}

void FolderPicker::renameRow(const QString& before, const QString& after)
{
    m_edit->sourceRenamed(before, after);
    m_rows.factory()->renameFolder(before, after);
    if (m_edit->isRenaming(before)) {
        continuefolderNameChanged(after); // continues the edit from the new name
        return;
    }
    const QModelIndex index = m_rows.getFolderIndex(before, m_edit->row());
    if (index.isValid()) {
        m_rows.setAttributeAtDoEdit(index, after);
        m_rows.insertChildrenIndex(index, after);
    }
    m_rows.factory()->importSourceData();
    m_tree->viewport()->update();
}

void FolderPicker::slotDeleteFolder(std::wstring name)
{
    const QString folder = plainName(name);
    const QString path = m_rows.folderPath(folder);
    if (FolderNameRules::isFolderName(folder) && !QFileInfo::exists(path))
        RefusedWrites::forgetFolder(path.toStdString()); // pending writes for a deleted folder are dropped
    if (m_rows.isNameOf(folder, currentFolderName()))
        setCurrentFolderName(QString());
    const QModelIndex index = m_rows.getFolderIndex(folder, m_edit->unmadeRow());
    if (!index.isValid())
        return;
    const QModelIndex current = m_rows.folderOf(m_tree->currentIndex());
    if (isVisible() && current.isValid() && current == index) {
        ChangeButtonState(NEW_FOLDER_AND_CANCEL);
        m_tree->setCurrentIndex(QModelIndex());
        m_preview->clearThumbnailArea();
    }
    m_rows.remove(index);
}

// --- Events ---------------------------------------------------------------------------------------------

void FolderPicker::paintEvent(QPaintEvent* event)
{
    QDialog::paintEvent(event);
    if (m_background.isNull()) // large, so it is not read before the dialog is shown
        m_background.load(QStringLiteral(":/ToolBarbg_bluegrid"));
    QPainter painter(this);
    painter.fillRect(rect(), FRAME_COLOR);
    const QRect inside = rect().marginsRemoved(FRAME);
    painter.fillRect(inside, QColor(50, 50, 50));
    painter.setClipRect(inside);
    painter.drawPixmap(0, 0, m_background);
    painter.setClipping(false);
    painter.setPen(FRAME_LINE_COLOR);
    painter.drawRect(inside.adjusted(0, 0, -1, -1));
    painter.drawRect(rect().adjusted(0, 0, -1, -1));
    for (const QPoint& start : {STARTPOINT_OF_TOP_HSEPARATOR, STARTPOINT_OF_BOTTOM_HSEPARATOR})
        painter.drawImage(QRect(start, QSize(HSEPARATOR_LENGTH, SEPARATOR_HEIGHT)), m_separator);
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
        m_edit->cancelEdit();
        m_edit->forgetMessage();
    }
    QDialog::hideEvent(event);
}

void FolderPicker::reject()
{
    if (m_buttons[CancelButton]->isEnabled())
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
        return m_edit->isMessageUp();
    case QEvent::MouseButtonPress:
    case QEvent::MouseButtonDblClick:
    case QEvent::TouchBegin:
        return isEditKept();
    default:
        return false;
    }
}
