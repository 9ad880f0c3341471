#pragma once

class QLabel;
class QMainWindow;
class QWidget;

// Arranges the widgets of the window: on the left the title row above the list of titles, on the right the
// tools bar, the canvas and the text panel, one below the other. All become children of the window.
class WindowLayout
{
public:
    // Makes the left column, as wide as the list, with the folder icon.
    static QWidget* leftColumn(QMainWindow* window, QLabel* folderLabel, QWidget* moveButton, QWidget* list);
    // Makes the central widget.
    static void arrange(QMainWindow* window, QWidget* leftColumn, QWidget* toolsBar, QWidget* canvas,
                        QWidget* panel);
};
