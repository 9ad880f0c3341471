#include "app/WindowLayout.h"

#include "touchui/NewLayout.h"

#include <QHBoxLayout>
#include <QLabel>
#include <QMainWindow>
#include <QPixmap>
#include <QPushButton>
#include <QVBoxLayout>

namespace
{

QPushButton* folderIcon(QWidget* parent)
{
    auto* icon = new QPushButton(parent);
    icon->setIcon(QIcon(QPixmap(QStringLiteral(":/FolderPicker/Titler_folder_icon"))));
    icon->setFixedSize(28, 30);
    icon->setIconSize(QSize(28, 28));
    icon->setEnabled(false);
    icon->setStyleSheet(QStringLiteral("border:0; background:transparent;"));
    return icon;
}

QLayout* titleRow(QWidget* icon, QLabel* folderLabel, QWidget* moveButton)
{
    auto* row = newLayout<QHBoxLayout>();
    row->addSpacing(6);
    row->addWidget(icon);
    row->addSpacing(7);
    row->addWidget(folderLabel);
    row->addStretch();
    row->addWidget(moveButton);
    row->addSpacing(0);
    return row;
}

QLayout* rightColumn(QWidget* toolsBar, QWidget* canvas, QWidget* panel)
{
    auto* canvasRow = newLayout<QHBoxLayout>();
    canvasRow->addSpacing(52);
    canvasRow->addWidget(canvas);
    canvasRow->addSpacing(31);

    auto* column = newLayout<QVBoxLayout>();
    column->addWidget(toolsBar);
    column->addSpacing(22);
    column->addLayout(canvasRow);
    column->addSpacing(43);
    column->addWidget(panel);
    column->addStretch();
    return column;
}

} // namespace

QWidget* WindowLayout::leftColumn(QMainWindow* window, QLabel* folderLabel, QWidget* moveButton,
                                  QWidget* list)
{
    auto* column = newLayout<QVBoxLayout>();
    column->addSpacing(8);
    column->addLayout(titleRow(folderIcon(window), folderLabel, moveButton));
    column->addSpacing(10);
    column->addWidget(list, 2);
    column->addStretch();

    auto* row = newLayout<QHBoxLayout>();
    row->addSpacing(6);
    row->addLayout(column);

    auto* left = new QWidget(window);
    left->setFixedWidth(list->width());
    left->setLayout(row);
    return left;
}

void WindowLayout::arrange(QMainWindow* window, QWidget* leftColumn, QWidget* toolsBar, QWidget* canvas,
                           QWidget* panel)
{
    auto* mainRow = newLayout<QHBoxLayout>();
    mainRow->addSpacing(8);
    mainRow->addWidget(leftColumn);
    mainRow->addLayout(rightColumn(toolsBar, canvas, panel));

    auto* central = new QWidget(window);
    auto* column = newLayout<QVBoxLayout>();
    column->addSpacing(8);
    column->addLayout(mainRow);
    column->addStretch();
    central->setLayout(column);
    window->setCentralWidget(central);
}
