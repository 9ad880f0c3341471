#include "app/WindowDialogs.h"

#include "app/APPEventFilter.h"
#include "app/WindowMasks.h"
#include "library/FolderPicker.h"
#include "library/TemplatePicker.h"

#include <QCoreApplication>
#include <QEvent>
#include <utility>

namespace
{

// Returns the type of an event that is sent to the window before or after the template dialog. Called once
// per type, since registering it again would give another number.
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

// Cancels the touch that opened the dialog, so that its release does not reach the widget below it.
void APPEventFilterUnlock()
{
    if (APPEventFilter* filter = APPEventFilter::instance())
        filter->unlock();
}

} // namespace

WindowDialogs::WindowDialogs(QWidget* window, WindowMasks* masks, FolderPicker* folderPicker,
                             TemplatePicker* templatePicker)
    : m_window(window), m_masks(masks), m_folderPicker(folderPicker), m_templatePicker(templatePicker)
{
}

void WindowDialogs::initFolderPicker()
{
    m_folderPicker->setDuplicateButtonEnabled(false);
    m_folderPicker->setCreateFolderButtonEnabled(true);
    m_folderPicker->setCancelButtonEnabled(true);
    m_folderPicker->showSoftKeyboard();
}

void WindowDialogs::showFolderDialog()
{
    if (m_folderPicker->isVisible())
        return;
    m_masks->setOpacityMaskVisible(true);
    m_folderPicker->setWindowModality(Qt::WindowModal);
    m_folderPicker->raise();
    m_folderPicker->activateWindow();
    m_folderPicker->exec();
    m_masks->setOpacityMaskVisible(false);
}

bool WindowDialogs::takeOpenedFromEditor()
{
    return std::exchange(m_origin, FolderDialogOrigin::Request) == FolderDialogOrigin::Editor;
}

void WindowDialogs::showTemplateDialog()
{
    if (m_templatePicker->isVisible()) // another request may arrive while it is open
        return;
    APPEventFilterUnlock();
    m_masks->setOpacityMaskVisible(true);
    const bool isOverFolderPicker = m_folderPicker->isVisible();
    if (isOverFolderPicker)
        m_folderPicker->showOpacityWidget(true);
    m_templatePicker->setModal(true);
    m_templatePicker->raise();
    m_templatePicker->activateWindow();
    m_templatePicker->setSelectedItem(false);
    QEvent begins(templateDialogBegins());
    QCoreApplication::sendEvent(m_window, &begins);
    m_templatePicker->exec();
    QEvent ends(templateDialogEnds());
    QCoreApplication::sendEvent(m_window, &ends);
    if (!isOverFolderPicker) {
        m_masks->setOpacityMaskVisible(false);
        return;
    }
    m_folderPicker->showOpacityWidget(false);
    // If no template was picked, the folder picker stays open above the darkened window.
    if (!m_templatePicker->isSelectedItem())
        m_folderPicker->setKeepFolderDialog();
}
