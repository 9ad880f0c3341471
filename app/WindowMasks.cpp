#include "app/WindowMasks.h"

#include "library/FolderPicker.h"
#include "library/TemplatePicker.h"
#include "panel/TextToolsPanel.h"

WindowMasks::WindowMasks(QWidget* window, TextToolsPanel* panel, FolderPicker* folderPicker,
                         TemplatePicker* templatePicker)
    : m_window(window)
    , m_panel(panel)
    , m_folderPicker(folderPicker)
    , m_templatePicker(templatePicker)
    , m_opacityMask(DialogMasks::createMask(window, window->rect()))
    , m_masks(window)
{
    m_opacityMask->hide();
}

void WindowMasks::setOpacityMaskVisible(bool visible)
{
    m_opacityMask->setGeometry(m_window->rect());
    m_opacityMask->raise();
    m_opacityMask->setVisible(visible);
}

bool WindowMasks::isOnTemplatePicker() const
{
    return m_templatePicker->isVisible() && !m_panel->colorPaletteIsShown();
}

bool WindowMasks::isOnFolderPicker() const
{
    return m_folderPicker->isVisible() && !m_templatePicker->isVisible() && !m_panel->colorPaletteIsShown();
}

void WindowMasks::showDialogMaskWidget(bool show)
{
    m_masks.showDialogMaskWidget(show);
    if (!show || m_panel->colorPaletteIsShown())
        m_panel->showDialogMaskWidget(show);
    if (!show || isOnTemplatePicker())
        m_templatePicker->showDialogMaskWidget(show);
    if (!show || isOnFolderPicker())
        m_folderPicker->showDialogMaskWidget(show);
}

void WindowMasks::showMessageMaskWidget(bool show)
{
    m_masks.showMessageMaskWidget(show);
    if (!show || m_panel->colorPaletteIsShown())
        m_panel->showMessageMaskWidget(show);
    if (!show || isOnTemplatePicker())
        m_templatePicker->showMessageMaskWidget(show);
    if (!show || isOnFolderPicker())
        m_folderPicker->showMessageMaskWidget(show);
}
