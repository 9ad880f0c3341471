#pragma once

class FolderPicker;
class QWidget;
class TemplatePicker;
class WindowMasks;

// Shows the folder picker and the template picker above the darkened window, and remembers whether the folder
// picker was opened by a request or from the editor. GUI thread.
class WindowDialogs
{
public:
    // None of them is owned; all must outlive this object.
    WindowDialogs(QWidget* window, WindowMasks* masks, FolderPicker* folderPicker,
                  TemplatePicker* templatePicker);

    // Sets the buttons of the folder picker to their state at the start of a session.
    void initFolderPicker();

    // Modal: returns when the dialog is closed. Does nothing while it is open.
    void showFolderDialog();
    // Notes that the folder picker is opened from the editor: after Cancel the title stays open.
    void noteOpenedFromEditor() { m_origin = FolderDialogOrigin::Editor; }
    // Returns whether the folder picker was opened from the editor, and resets that.
    bool takeOpenedFromEditor();

    // Modal: returns when the dialog is closed. Does nothing while it is open.
    void showTemplateDialog();

private:
    enum class FolderDialogOrigin { Request, Editor };

    QWidget* m_window;
    WindowMasks* m_masks;
    FolderPicker* m_folderPicker;
    TemplatePicker* m_templatePicker;
    FolderDialogOrigin m_origin = FolderDialogOrigin::Request;
};
