#pragma once

#include "touchui/DialogMasks.h"

class FolderPicker;
class QWidget;
class TemplatePicker;
class TextToolsPanel;

// Darkens the window behind its own dialogs, and shows the masks that sibling processes request while they
// show a dialog or a message box. Such a mask also covers the topmost open dialog of this program. GUI
// thread.
class WindowMasks
{
public:
    // None of them is owned; all must outlive this object.
    WindowMasks(QWidget* window, TextToolsPanel* panel, FolderPicker* folderPicker,
                TemplatePicker* templatePicker);

    // Shows or hides the mask behind the window's own dialogs.
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
