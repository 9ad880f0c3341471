// The window's dealings with the template picker.
#include "app/TitlerWindow.h"

#include "app/APPEventFilter.h"
#include "app/EditTitlerController.h"
#include "canvas/CanvasScene.h"
#include "library/ArchiveList.h"
#include "library/FolderPicker.h"
#include "library/TemplatePicker.h"

#include <QCoreApplication>
#include <QEvent>

namespace
{

// Sent to the window around the dialog; registered once, since a second registration gives another number.
QEvent::Type userEvent(int wanted)
{
    return static_cast<QEvent::Type>(QEvent::registerEventType(wanted));
}

QEvent::Type templateDialogBegins()
{
    static const QEvent::Type type = userEvent(1150);
    return type;
}

QEvent::Type templateDialogEnds()
{
    static const QEvent::Type type = userEvent(1151);
    return type;
}

// The finger that opened the dialog does not come up in the widget under it.
void APPEventFilterUnlock()
{
    if (APPEventFilter* filter = APPEventFilter::instance())
        filter->unlock();
}

} // namespace

void TitlerWindow::connectForTemplates()
{
    connect(mTemplatePicker, &TemplatePicker::selectedTemplate, this,
            &TitlerWindow::slotStartCreateNewArchiveFromTemplate);
    connect(mTemplatePicker, &TemplatePicker::signalCloseSoftwareKeyBoardForFileManager, mFolderPicker,
            &FolderPicker::slotCloseSoftwareKeyBoardForFileManager);
    connect(mArchiveList, &ArchiveList::addUserSignal, mTemplatePicker, &TemplatePicker::slotSaveAsTemplate);
}

void TitlerWindow::connectForTemplateNotices()
{
    connect(mEditTitlerController, &EditTitlerController::importNewUserTemplate, mTemplatePicker,
            &TemplatePicker::slotImportNewUserTemplate);
    connect(mEditTitlerController, &EditTitlerController::deleteUserTemplate, mTemplatePicker,
            &TemplatePicker::slotDeleteUserTemplate);
    connect(mEditTitlerController, &EditTitlerController::renameUserTemplate, mTemplatePicker,
            &TemplatePicker::slotRenameUserTemplate);
}

void TitlerWindow::showTemplateDialog()
{
    if (mTemplatePicker->isVisible()) // a second request for what is open already
        return;
    APPEventFilterUnlock();
    setOpacityMaskVisible(true);
    const bool isOverFolderPicker = mFolderPicker->isVisible();
    if (isOverFolderPicker)
        mFolderPicker->showOpacityWidget(true);
    mTemplatePicker->setModal(true);
    mTemplatePicker->raise();
    mTemplatePicker->activateWindow();
    mTemplatePicker->setSelectedItem(false);
    QEvent begins(templateDialogBegins());
    QCoreApplication::sendEvent(this, &begins);
    mTemplatePicker->exec();
    QEvent ends(templateDialogEnds());
    QCoreApplication::sendEvent(this, &ends);
    if (!isOverFolderPicker) {
        setOpacityMaskVisible(false);
        return;
    }
    mFolderPicker->showOpacityWidget(false);
    // Without a template the operator is back in the folder picker, which stays open over the darkened
    // window.
    if (!mTemplatePicker->isSelectedItem())
        mFolderPicker->setKeepFolderDialog();
}

void TitlerWindow::showTemplateDialogOnUser()
{
    mTemplatePicker->showUserTemplateTab();
    showTemplateDialog();
}

void TitlerWindow::slotStartCreateNewArchiveFromTemplate(Archive* archiveData)
{
    mArchiveList->createArchiveFromTemplate(archiveData);
    mCanvasScene->createThumnailPicture();
}

// Darkens the window behind a dialog.
void TitlerWindow::setOpacityMaskVisible(bool visible)
{
    mOpacityMask->setGeometry(rect());
    mOpacityMask->raise();
    mOpacityMask->setVisible(visible);
}
