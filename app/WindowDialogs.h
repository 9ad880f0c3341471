#pragma once

class FolderPicker;
class QWidget;
class TemplatePicker;
class WindowMasks;

// Shows the folder picker and the template picker over the darkened window, and knows from where the folder
// picker was opened. GUI thread.
class WindowDialogs
{
public:
    // None is owned, and all outlive this object.
    WindowDialogs(QWidget* window, WindowMasks* masks, FolderPicker* folderPicker,
                  TemplatePicker* templatePicker);

    // Sets the buttons of the folder picker as a session begins with them.
    void initFolderPicker();

    // Modal: returns when the dialog closes. Does nothing while it is open.
    void showFolderDialog();
    // Notes that the editor opens the folder picker: Cancel leads back to the title that is still open.
    void noteOpenedFromEditor() { m_origin = FolderDialogOrigin::Editor; }
    // Returns whether the editor has opened the folder picker, and forgets that.
    bool takeOpenedFromEditor();

    // Modal: returns when the dialog closes. Does nothing while it is open.
    void showTemplateDialog();

private:
    enum class FolderDialogOrigin { Request, Editor };

    QWidget* m_window;
    WindowMasks* m_masks;
    FolderPicker* m_folderPicker;
    TemplatePicker* m_templatePicker;
    FolderDialogOrigin m_origin = FolderDialogOrigin::Request;
};
