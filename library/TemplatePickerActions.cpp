// What the operator and the file manager do with templates.
#include "canvas/MessageBoxController.h"
#include "library/ArchiveItem.h"
#include "library/ListMessages.h"
#include "library/TemplateItem.h"
#include "library/TemplatePicker.h"
#include "library/TemplateScrollArea.h"
#include "library/TemplateTab.h"
#include "library/TitlerTabWidget.h"
#include "support/ConfinedPath.h"
#include "support/LogManager.h"
#include "touchui/KSPushbutton.h"

#include <QDir>
#include <QFileInfo>
#include <memory>
#include <string>

namespace
{

const int NOT_FOUND_NUMBER = 400;
const int WARNING_PRIORITY = 4;

// What stands behind the last "/", if it is not the end.
QString lastPartOf(const QString& path)
{
    return QFileInfo(QDir::cleanPath(path)).fileName();
}

// The folder that holds the file of this path; a path that ends with "/" is that of the folder.
QString folderOf(const QString& path)
{
    const QString clean = QDir::cleanPath(path);
    return path.endsWith(QLatin1Char('/')) ? clean : QFileInfo(clean).path();
}

// The template that a path leads to. Others tell a file in its folder, whichever it is, or the folder, with a
// "/" or not; what does not lead to a template goes by the name of the path's folder.
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

void TemplatePicker::initImageView()
{
    mPresetTab->setTemplates(mController.getTemplates(mReloadRule.language(), mPin));
}

void TemplatePicker::initImageView2()
{
    mUserTab->setTemplates(mUserController.getTemplates());
}

void TemplatePicker::reloadTemplates(SystemSetupDef::emSystemLanguageType language)
{
    if (!mReloadRule.needsReload(language, mPin))
        return;
    mReloadRule.reloaded(language, mPin);
    initImageView();
}

void TemplatePicker::reloadTemplates2()
{
    initImageView2();
}

void TemplatePicker::showUserTemplateTab()
{
    mTabs->setCurrentIndex(1);
    mUserTab->scrollToEnd();
}

TemplateItem* TemplatePicker::addNewTemplateToLast(Archive* archive)
{
    return mUserTab->addNewTemplateToLast(archive);
}

void TemplatePicker::itemSelected(QPushButton* button)
{
    if (auto* item = qobject_cast<TemplateItem*>(button))
        item->clickTriggered();
}

void TemplatePicker::triggerSelected(int index, TemplateItem* item)
{
    LOG_USER_OPERATE(L"Template Area", 200, L"Select the " + std::to_wstring(index) + L" thumnail");
    (item->isUser() ? mUserTab : mPresetTab)->select(item);
}

void TemplatePicker::updateButtons()
{
    const bool isUserTab = mTabs->currentIndex() == 1;
    mSelectButton->setVisible(!isUserTab);
    mSelectButton2->setVisible(isUserTab);
    mSelectButton->setEnabled(mPresetTab->selectedItem() != nullptr);
    mSelectButton2->setEnabled(mUserTab->selectedItem() != nullptr);
    mDeleteButton2->setEnabled(mUserTab->selectedItem() != nullptr);
}

void TemplatePicker::updateUserTemplateArea()
{
    const Archive* archive = mUserTab->selectedArchive();
    updateTextObjectArea(archive ? *archive : Archive());
    updateFilenameArea(archive ? TemplateTab::templateName(*archive) : QString());
}

void TemplatePicker::updateTextObjectArea(const Archive& archive)
{
    mPreviewArchive = archive;
    mPreview->updateRightChild();
}

void TemplatePicker::cancelClicked()
{
    LOG_USER_OPERATE(L"Template Area", 200, L"Tap Cancel Button");
    reject();
}

void TemplatePicker::selectClicked()
{
    take(*mPresetTab);
}

void TemplatePicker::selectClicked2()
{
    take(*mUserTab);
}

void TemplatePicker::take(TemplateTab& tab)
{
    Archive* archive = tab.selectedArchive();
    if (!archive)
        return;
    mSelectedItem = true;
    Q_EMIT selectedTemplate(archive);
    accept();
}

void TemplatePicker::deleteClicked2()
{
    Q_EMIT signalCloseSoftwareKeyBoardForFileManager();
    const Archive* archive = mUserTab->selectedArchive();
    MessageBoxController* messages = MessageBoxController::getInstance();
    if (!archive || !messages)
        return;
    mAskedItem = mUserTab->selectedItem();
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
    const bool isAsked = mAskedItem && mAskedItem == mUserTab->selectedItem();
    mAskedItem.clear();
    if (param.closeType != MessageDefine::CLOSE_OK || !isAsked)
        return;
    const int id = deleteUserTemplate();
    if (id != -1)
        mUserTab->removeTemplate(id);
}

int TemplatePicker::deleteUserTemplate()
{
    const Archive* archive = mUserTab->selectedArchive();
    if (!archive || mUserController.deleteTemplate(archive->getPath()) == 0)
        return -1;
    return mUserTab->selectedItem()->getIndex();
}

void TemplatePicker::overrideTemplate(int id)
{
    mUserTab->removeTemplate(id);
}

int TemplatePicker::findTemplateIdFromName(const QString& name) const
{
    return mUserTab->findTemplateIdFromName(name);
}

void TemplatePicker::slotSaveAsTemplate(QString name)
{
    auto archive = std::make_unique<Archive>();
    const bool isRead = mUserController.loadTemplate(name.toStdString(), archive.get()) != 0;
    mUserController.addNewTemplateToLastInOrderXml(name.toStdString());
    TemplateItem* item = addNewTemplateToLast(archive.release());
    if (isRead)
        mUserTab->select(item); // what the picker scrolls to
}

void TemplatePicker::slotImportNewUserTemplate(QString name)
{
    if (!mUserController.isTemplatePath(name)) {
        ConfinedPath::logRefusal(L"a new template is said to be in: ", name.toStdString());
        return;
    }
    if (name.contains(QLatin1Char('/')))
        name = QFileInfo(name).isDir() ? lastPartOf(name) : templateNameIn(*mUserTab, name);
    const int id = findTemplateIdFromName(name);
    if (id != -1)
        overrideTemplate(id);
    auto archive = std::make_unique<Archive>();
    const int result = mUserController.createNewTemplateXml(name.toStdString(), archive.get());
    if (result < 0)
        ListMessages::post(MessageDef::MESSAGE_DISK_FULL_ON_TEMPLATE, name);
    if (result < 1) {
        // No such folder, or no room: there is nothing to offer, nor is what had the name before.
        mUserController.removeFromOrderXml(name.toStdString());
        return;
    }
    mUserController.addNewTemplateToLastInOrderXml(name.toStdString());
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
    if (!mUserController.isTemplatePath(folder)) {
        ConfinedPath::logRefusal(L"a template is said to be in: ", path.toStdString());
        return;
    }
    Archive* archive = mUserTab->archive(id);
    archive->setName((newName + QStringLiteral("/Titler")).toStdString());
    archive->setPath((folder + QStringLiteral("/Titler.xml")).toStdString());
    TemplateItem* item = mUserTab->item(id);
    item->setImage(archive->getFullPathOfThumbnailSmall());
    if (item == mUserTab->selectedItem()) {
        updateFilenameArea(newName);
        mUserTab->saveSelection();
    }
    mUserController.renameInOrderXml(oldName.toStdString(), newName.toStdString());
}

void TemplatePicker::slotDeleteUserTemplate(QString path)
{
    const QString name = templateNameIn(*mUserTab, path);
    const int id = mUserController.isTemplatePath(path) ? findTemplateIdFromName(name) : -1;
    if (id == -1) {
        logNotFound(L"slotDeleteUserTemplate() \"" + name.toStdWString() + L"(" + path.toStdWString() +
                    L")\" is not found.");
        return;
    }
    overrideTemplate(id);
    mUserController.reCreateNewOrderXml();
}
