#pragma once

#include "touchui/DialogMasks.h"

class FolderPicker;
class QWidget;
class TemplatePicker;
class TextToolsPanel;

// All that darkens the window: what lies behind its own dialogs, and the masks that siblings ask for while
// they show a dialog or a message box. Such a mask also lies on the topmost dialog of this program that is
// open. GUI thread.
class WindowMasks
{
public:
    // None is owned, and all outlive this object.
    WindowMasks(QWidget* window, TextToolsPanel* panel, FolderPicker* folderPicker,
                TemplatePicker* templatePicker);

    // Darkens the window behind a dialog of its own.
    void setOpacityMaskVisible(bool visible);

    void showDialogMaskWidget(bool show);
    void showMessageMaskWidget(bool show);

private:
    bool isOnTemplatePicker() const;
    bool isOnFolderPicker() const;

    QWidget* m_window;
    TextToolsPanel* m_panel;
    FolderPicker* m_folderPicker;
    TemplatePicker* m_templatePicker;
    QWidget* m_opacityMask;
    DialogMasks m_masks;
};
