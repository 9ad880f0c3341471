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

// Sent to the window around the template dialog; registered once, since a second registration gives another
// number.
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
    if (m_templatePicker->isVisible()) // a second request for what is open already
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
    // Without a template the operator is back in the folder picker, which stays open over the darkened
    // window.
    if (!m_templatePicker->isSelectedItem())
        m_folderPicker->setKeepFolderDialog();
}
