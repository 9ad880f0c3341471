#include "library/TemplatePicker.h"

#include "canvas/DrawBoundingRectangle.h"
#include "canvas/MessageBoxController.h"
#include "library/ArchiveItem.h"
#include "library/ListMessages.h"
#include "library/TemplateItem.h"
#include "library/TemplateScrollArea.h"
#include "library/TemplateTab.h"
#include "library/TitlerTabWidget.h"
#include "support/ConfinedPath.h"
#include "support/LogManager.h"
#include "touchui/KSPushbutton.h"
#include "touchui/WindowPlaceKeeper.h"

#include <QBitmap>
#include <QDir>
#include <QFileInfo>
#include <QFontMetrics>
#include <QLabel>
#include <QPainter>
#include <QShowEvent>
#include <memory>
#include <string>
#include <utility>

const QSize TemplatePicker::SCREEN_SIZE(SCREEN_WIDTH, SCREEN_HEIGHT);
const QSize TemplatePicker::TAB_AREA_SIZE(TAB_AREA_WIDTH, TAB_AREA_HIGHT);
const QSize TemplatePicker::SCROLL_AREA_SIZE(SCROLL_AREA_WIDTH, SCROLL_AREA_HIGHT);
const QRect TemplatePicker::LINE_RECT(QPoint(12, 59), QPoint(1358, 62));
const QRect TemplatePicker::BTMLINE_RECT(QPoint(12, 744), QPoint(1358, 747));
const QPoint TemplatePicker::OUTSIDE_BORDER_STARTPOINT(0, 0);
const QPoint TemplatePicker::INSIDE_BORDER_STARTPOINT(122, 160);
const QSize TemplatePicker::TOOLBARBTN_SIZE(220, 40);

namespace
{

const int DIALOG_FRAME = 7; // kind, see DrawBoundingRectangle
const int TITLE_FONT_SIZE = 28;
const int FONT_SIZE = 24;
const int CAPTION_HEIGHT = 34;
constexpr QMargins FRAME(10, 6, 9, 12);

// In coordinates of the dialog.
const int TABS_LEFT = (TemplatePicker::SCREEN_WIDTH - TemplatePicker::TAB_AREA_WIDTH) / 2;
const int TABS_TOP = 62 + TemplatePicker::PARTS_SPACE;
const int BUTTONS_TOP = (747 + TemplatePicker::SCREEN_HEIGHT - TemplatePicker::OUTER_MARGIN_HIGHT) / 2 - 20;

// In coordinates of the tab widget.
const int PANE_LEFT = TemplatePicker::TAB_AREA_OUTTER_MARGIN_WIDTH;
const int PANE_TOP = TemplatePicker::TABS_HIGHT + TemplatePicker::PAINS_SPACE;
const int PANE_WIDTH = TemplatePicker::SCROLL_AREA_WIDTH + 2 * TemplatePicker::PAIN_LINE;
const int PROPERTY_LEFT = PANE_LEFT + PANE_WIDTH + TemplatePicker::PAINS_SPACE;

const int NOT_FOUND_NUMBER = 400;
const int WARNING_PRIORITY = 4;

// Returns the last part of the path; a "/" at its end is ignored.
QString lastPartOf(const QString& path)
{
    return QFileInfo(QDir::cleanPath(path)).fileName();
}

// Returns the folder that contains the file of this path; for a path that ends with "/" that folder itself.
QString folderOf(const QString& path)
{
    const QString clean = QDir::cleanPath(path);
    return path.endsWith(QLatin1Char('/')) ? clean : QFileInfo(clean).path();
}

// Returns the name of the template for a path, which other processes give as any file in its folder or as the
// folder itself, with or without a "/" at its end. If neither is a template, returns the name of the folder
// that contains the path.
QString templateNameIn(const TemplateTab& tab, const QString& path)
{
    const QString name = lastPartOf(folderOf(path));
    const QString last = lastPartOf(path);
    return tab.findTemplateIdFromName(name) == -1 && tab.findTemplateIdFromName(last) != -1 ? last : name;
}

void logNotFound(const std::wstring& text)
{
    LOG_EVENT(L"TemplatePicker", NOT_FOUND_NUMBER, text, WARNING_PRIORITY);
}

} // namespace

TemplatePicker::TemplatePicker(QWidget* parent)
    : QDialog(parent, Qt::Dialog | Qt::FramelessWindowHint)
    , m_reloadRule(SystemSetupDef::emSystemLanguageUnknown, false)
    , m_separator(QStringLiteral(":/Separator_H"))
    , m_masks(this, FRAME)
{
    setObjectName(QStringLiteral("TemplateOverview"));
    setStyleSheet(QStringLiteral(" QWidget#TemplateOverview { background:transparent; }"));
    setAttribute(Qt::WA_TranslucentBackground);
    new WindowPlaceKeeper(this); // owned by this dialog
    setAttribute(Qt::WA_AcceptTouchEvents);
    setFixedSize(SCREEN_SIZE);
    m_title = createLabel(this, QRect(TABS_LEFT, OUTER_MARGIN_HIGHT, TAB_AREA_WIDTH, LINE_RECT.top() - 9),
                          "templatePickerTitle");
    createTabs();
    createPropertyArea();
    createButtons();
    setSystemLanFont(QFont(QStringLiteral("KST")));
    translateText();
    initImageView2();
}

TemplatePicker::~TemplatePicker()
{
    // Deleted first, since the tabs use the controllers.
    delete m_tabs;
}

void TemplatePicker::createTabs()
{
    m_tabs = new TitlerTabWidget(this);
    m_tabs->setGeometry(QRect(QPoint(TABS_LEFT, TABS_TOP), TAB_AREA_SIZE));
    m_tabs->setPainLine(PANE_LEFT, PANE_TOP);
    m_presetTab = new TemplateTab(m_controller, false);
    m_userTab = new TemplateTab(m_userController, true);
    for (TemplateTab* tab : {m_presetTab, m_userTab}) {
        m_tabs->addTab(tab, QString());
        connect(tab, &TemplateTab::itemSelected, this, &TemplatePicker::triggerSelected);
        connect(tab, &TemplateTab::itemPressed, this, &TemplatePicker::itemSelected);
        connect(tab, &TemplateTab::selectionChanged, this, &TemplatePicker::updateButtons);
    }
    connect(m_userTab, &TemplateTab::selectionChanged, this, &TemplatePicker::updateUserTemplateArea);
    connect(m_tabs, &QTabWidget::currentChanged, this, &TemplatePicker::updateButtons);
}

QLabel* TemplatePicker::createLabel(QWidget* parent, const QRect& area, const char* name)
{
    auto* label = new QLabel(parent);
    label->setObjectName(QLatin1String(name));
    label->setTextFormat(Qt::PlainText);
    label->setStyleSheet(QStringLiteral("background: transparent; color:rgb(220, 220, 220);"));
    label->setGeometry(area);
    return label;
}

// Creates the widgets beside the grid. They are placed later, when the tab pages have their places.
void TemplatePicker::createPropertyArea()
{
    const QRect none;
    m_fileNameCaption = createLabel(m_userTab, none, "fileNameCaption");
    m_fileName = createLabel(m_userTab, none, "fileName");
    m_fileName->setStyleSheet(
        QStringLiteral("background: rgb(38, 38, 38); color:rgb(178, 178, 178); padding: 0px 6px;"));
    m_textCaption = createLabel(m_userTab, none, "textCaption");
    m_preview = new ArchiveItem(&m_previewArchive, ArchiveItem::NARROW_ITEM, m_userTab);
    m_preview->initArchiveItemChildWidget();
    m_preview->setFixedWidth(PROPERTY_AREA_PARTS_WIDTH); // same width as the box of the file name
    m_deleteButton2 = createButton(m_userTab, QPoint(), "deleteTemplateButton");
    connect(m_deleteButton2, &QPushButton::clicked, this, &TemplatePicker::deleteClicked2);
}

void TemplatePicker::createButtons()
{
    const int cancelLeft = TABS_LEFT + TAB_AREA_WIDTH - TOOLBARBTN_SIZE.width();
    const QPoint selectPos(cancelLeft - PAINS_SPACE - TOOLBARBTN_SIZE.width(), BUTTONS_TOP);
    m_selectButton = createButton(this, selectPos, "selectPresetButton");
    m_selectButton2 = createButton(this, selectPos, "selectUserButton");
    m_cancelButton = createButton(this, QPoint(cancelLeft, BUTTONS_TOP), "cancelTemplateButton");
    connect(m_selectButton, &QPushButton::clicked, this, &TemplatePicker::selectClicked);
    connect(m_selectButton2, &QPushButton::clicked, this, &TemplatePicker::selectClicked2);
    connect(m_cancelButton, &QPushButton::clicked, this, &TemplatePicker::cancelClicked);
}

KSPushbutton* TemplatePicker::createButton(QWidget* parent, const QPoint& position, const char* name)
{
    auto* button = new KSPushbutton(QString::fromLatin1(KSPushbutton::STANDARD_IMAGES), parent);
    button->setObjectName(QLatin1String(name));
    button->setStyleSheet(QStringLiteral("color:rgb(220, 220, 220);"));
    button->setGeometry(QRect(position, TOOLBARBTN_SIZE));
    button->setAutoDefault(false);
    connect(button, &QAbstractButton::pressed, this, [this, button] { buttonPressed(button); });
    connect(button, &QAbstractButton::released, this, [this, button] { buttonReleased(button); });
    return button;
}

void TemplatePicker::buttonPressed(KSPushbutton* button)
{
    button->changeButtonState(KSPushbutton::ButtonPressed);
}

void TemplatePicker::buttonReleased(KSPushbutton* button)
{
    button->changeButtonState(button->isEnabled() ? KSPushbutton::ButtonRest : KSPushbutton::ButtonDisabled);
}

void TemplatePicker::setSystemLanFont(QFont font)
{
    font.setPixelSize(TITLE_FONT_SIZE);
    m_title->setFont(font);
    font.setPixelSize(FONT_SIZE);
    for (QWidget* widget :
         std::initializer_list<QWidget*>{m_tabs, m_fileNameCaption, m_fileName, m_textCaption, m_selectButton,
                                         m_selectButton2, m_deleteButton2, m_cancelButton})
        widget->setFont(font);
    m_preview->updateRightChild();
    updateUserTemplateArea();
}

void TemplatePicker::translateText()
{
    m_title->setText(tr("Templates"));
    m_tabs->setTabText(0, tr("Preset"));
    m_tabs->setTabText(1, tr("User"));
    m_fileNameCaption->setText(tr("File Name"));
    m_textCaption->setText(tr("Text"));
    m_selectButton->setText(tr("Select"));
    m_selectButton2->setText(tr("Select"));
    m_deleteButton2->setText(tr("Delete"));
    m_cancelButton->setText(tr("Cancel"));
}

void TemplatePicker::showEvent(QShowEvent* event)
{
    initImageView();
    QDialog::showEvent(event);
    if (m_frame.isNull()) {
        m_frame = DrawBoundingRectangle().paintBoundingRectangle(DIALOG_FRAME);
        setMask(m_frame.mask()); // otherwise the corners are black without a compositor
    }
    if (const QWidget* window = parentWidget())
        move(window->mapToGlobal(window->rect().center()) - rect().center());
    for (TemplateTab* tab : {m_presetTab, m_userTab})
        tab->scrollArea()->move(tab->mapFrom(m_tabs, QPoint(PANE_LEFT + PAIN_LINE, PANE_TOP + PAIN_LINE)));
    const int width = PROPERTY_AREA_PARTS_WIDTH;
    QPoint place = m_userTab->mapFrom(m_tabs, QPoint(PROPERTY_LEFT, PANE_TOP));
    for (QLabel* label : {m_fileNameCaption, m_fileName}) {
        label->setGeometry(QRect(place, QSize(width, CAPTION_HEIGHT)));
        place.ry() += CAPTION_HEIGHT + PARTS_SPACE;
    }
    m_textCaption->setGeometry(QRect(place, QSize(width, CAPTION_HEIGHT)));
    m_preview->move(place + QPoint(0, CAPTION_HEIGHT + PARTS_SPACE));
    const int bottom =
        m_presetTab->mapFrom(m_tabs, QPoint(0, PANE_TOP + SCROLL_AREA_HIGHT + 2 * PAIN_LINE)).y();
    m_deleteButton2->move(place.x() + (width - TOOLBARBTN_SIZE.width()) / 2,
                          bottom - TOOLBARBTN_SIZE.height());
    updateUserTemplateArea(); // elides the name to the width it has now
}

void TemplatePicker::updateFilenameArea(const QString& name)
{
    const int room = m_fileName->contentsRect().width() - 12;
    const QFontMetrics metrics(m_fileName->font());
    m_fileName->setText(
        metrics.horizontalAdvance(name) > room ? metrics.elidedText(name, Qt::ElideRight, room) : name);
}

void TemplatePicker::paintEvent(QPaintEvent* event)
{
    QDialog::paintEvent(event);
    QPainter painter(this);
    painter.drawPixmap(OUTSIDE_BORDER_STARTPOINT, m_frame);
    drawHorizontalLine(painter);
}

void TemplatePicker::drawHorizontalLine(QPainter& painter)
{
    painter.drawImage(LINE_RECT, m_separator);
    painter.drawImage(BTMLINE_RECT, m_separator);
}

// --- What the operator and the file manager do with templates ----------------------------------------------

TemplateTab* TemplatePicker::presetTab()
{
    initImageView();
    return m_presetTab;
}

void TemplatePicker::initImageView()
{
    if (std::exchange(m_arePresetsRead, true))
        return;
    m_presetTab->setTemplates(m_controller.getTemplates(m_reloadRule.language(), m_pin));
}

void TemplatePicker::initImageView2()
{
    m_userTab->setTemplates(m_userController.getTemplates());
}

void TemplatePicker::reloadTemplates(SystemSetupDef::emSystemLanguageType language)
{
    if (!m_reloadRule.needsReload(language, m_pin))
        return;
    m_reloadRule.reloaded(language, m_pin);
    m_arePresetsRead = false;
    if (isVisible())
        initImageView();
}

void TemplatePicker::reloadTemplates2()
{
    initImageView2();
}

void TemplatePicker::showUserTemplateTab()
{
    m_tabs->setCurrentIndex(1);
    m_userTab->scrollToEnd();
}

TemplateItem* TemplatePicker::addNewTemplateToLast(Archive* archive)
{
    return m_userTab->addNewTemplateToLast(archive);
}

void TemplatePicker::itemSelected(QPushButton* button)
{
    if (auto* item = qobject_cast<TemplateItem*>(button))
        item->clickTriggered();
}

void TemplatePicker::triggerSelected(int index, TemplateItem* item)
{
    LOG_USER_OPERATE(L"Template Area", 200, L"Select the " + std::to_wstring(index) + L" thumnail");
    (item->isUser() ? m_userTab : m_presetTab)->select(item);
}

void TemplatePicker::updateButtons()
{
    const bool isUserTab = m_tabs->currentIndex() == 1;
    m_selectButton->setVisible(!isUserTab);
    m_selectButton2->setVisible(isUserTab);
    m_selectButton->setEnabled(m_presetTab->selectedItem() != nullptr);
    m_selectButton2->setEnabled(m_userTab->selectedItem() != nullptr);
    m_deleteButton2->setEnabled(m_userTab->selectedItem() != nullptr);
}

void TemplatePicker::updateUserTemplateArea()
{
    const Archive* archive = m_userTab->selectedArchive();
    updateTextObjectArea(archive ? *archive : Archive());
    updateFilenameArea(archive ? TemplateTab::templateName(*archive) : QString());
}

void TemplatePicker::updateTextObjectArea(const Archive& archive)
{
    m_previewArchive = archive;
    m_preview->updateRightChild();
}

void TemplatePicker::cancelClicked()
{
    LOG_USER_OPERATE(L"Template Area", 200, L"Tap Cancel Button");
    reject();
}

void TemplatePicker::selectClicked()
{
    take(*m_presetTab);
}

void TemplatePicker::selectClicked2()
{
    take(*m_userTab);
}

void TemplatePicker::take(TemplateTab& tab)
{
    Archive* archive = tab.selectedArchive();
    if (!archive)
        return;
    m_selectedItem = true;
    Q_EMIT selectedTemplate(archive);
    accept();
}

void TemplatePicker::deleteClicked2()
{
    Q_EMIT signalCloseSoftwareKeyBoardForFileManager();
    const Archive* archive = m_userTab->selectedArchive();
    MessageBoxController* messages = MessageBoxController::getInstance();
    if (!archive || !messages)
        return;
    m_askedItem = m_userTab->selectedItem();
    connect(messages, &MessageBoxController::signalCloseMessage, this,
            &TemplatePicker::slotDeleteCloseMessage, Qt::UniqueConnection);
    messages->postMessage(MessageDef::MESSAGE_DELETE_TEMPLATE, TemplateTab::templateName(*archive));
}

void TemplatePicker::slotDeleteCloseMessage(MessageDefine::tagCloseParam param)
{
    if (param.messageId != MessageDef::MESSAGE_DELETE_TEMPLATE)
        return;
    if (MessageBoxController* messages = MessageBoxController::getInstance())
        disconnect(messages, &MessageBoxController::signalCloseMessage, this,
                   &TemplatePicker::slotDeleteCloseMessage);
    const bool isAsked = m_askedItem && m_askedItem == m_userTab->selectedItem();
    m_askedItem.clear();
    if (param.closeType != MessageDefine::CLOSE_OK || !isAsked)
        return;
    const int id = deleteUserTemplate();
    if (id != -1)
        m_userTab->removeTemplate(id);
}

int TemplatePicker::deleteUserTemplate()
{
    const Archive* archive = m_userTab->selectedArchive();
    if (!archive || m_userController.deleteTemplate(archive->getPath()) == 0)
        return -1;
    return m_userTab->selectedItem()->getIndex();
}

void TemplatePicker::overrideTemplate(int id)
{
    m_userTab->removeTemplate(id);
}

int TemplatePicker::findTemplateIdFromName(const QString& name) const
{
    return m_userTab->findTemplateIdFromName(name);
}

void TemplatePicker::slotSaveAsTemplate(QString name)
{
    auto archive = std::make_unique<Archive>();
    const bool isRead = m_userController.loadTemplate(name.toStdString(), archive.get()) != 0;
    m_userController.addNewTemplateToLastInOrderXml(name.toStdString());
    TemplateItem* item = addNewTemplateToLast(archive.release());
    if (isRead)
        m_userTab->select(item); // the picker scrolls to the selected item
}

void TemplatePicker::slotImportNewUserTemplate(QString name)
{
    if (!m_userController.isTemplatePath(name)) {
        ConfinedPath::logRefusal(L"a new template is said to be in: ", name.toStdString());
        return;
    }
    if (name.contains(QLatin1Char('/')))
        name = QFileInfo(name).isDir() ? lastPartOf(name) : templateNameIn(*m_userTab, name);
    const int id = findTemplateIdFromName(name);
    if (id != -1)
        overrideTemplate(id);
    auto archive = std::make_unique<Archive>();
    const int result = m_userController.createNewTemplateXml(name.toStdString(), archive.get());
    if (result < 0)
        ListMessages::post(MessageDef::MESSAGE_DISK_FULL_ON_TEMPLATE, name);
    if (result < 1) {
        // The folder does not exist or the disk is full, so the template is not offered. A previous template
        // of this name does not exist any more either.
        m_userController.removeFromOrderXml(name.toStdString());
        return;
    }
    m_userController.addNewTemplateToLastInOrderXml(name.toStdString());
    addNewTemplateToLast(archive.release());
}

void TemplatePicker::slotRenameUserTemplate(QString oldName, QString newName, QString path)
{
    LOG_DEBUG_OPERATE(L"TemplatePicker", 200,
                      L"slotRenameUserTemplate() " + oldName.toStdWString() + L" -> " +
                          newName.toStdWString());
    const int id = findTemplateIdFromName(oldName);
    if (id == -1) {
        logNotFound(L"slotRenameUserTemplate() \"" + oldName.toStdWString() +
                    L"\" is not found. cannot rename to \"" + newName.toStdWString() + L"\".");
        return;
    }
    const QString folder = lastPartOf(path) == newName ? QDir::cleanPath(path) : folderOf(path);
    if (!m_userController.isTemplatePath(folder)) {
        ConfinedPath::logRefusal(L"a template is said to be in: ", path.toStdString());
        return;
    }
    Archive* archive = m_userTab->archive(id);
    archive->setName((newName + QStringLiteral("/Titler")).toStdString());
    archive->setPath((folder + QStringLiteral("/Titler.xml")).toStdString());
    TemplateItem* item = m_userTab->item(id);
    item->setImage(archive->getFullPathOfThumbnailSmall());
    if (item == m_userTab->selectedItem()) {
        updateFilenameArea(newName);
        m_userTab->saveSelection();
    }
    m_userController.renameInOrderXml(oldName.toStdString(), newName.toStdString());
}

void TemplatePicker::slotDeleteUserTemplate(QString path)
{
    const QString name = templateNameIn(*m_userTab, path);
    const int id = m_userController.isTemplatePath(path) ? findTemplateIdFromName(name) : -1;
    if (id == -1) {
        logNotFound(L"slotDeleteUserTemplate() \"" + name.toStdWString() + L"(" + path.toStdWString() +
                    L")\" is not found.");
        return;
    }
    overrideTemplate(id);
    m_userController.reCreateNewOrderXml();
}
