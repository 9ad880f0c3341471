#pragma once

#include <QList>
#include <QString>

// The steps of the two size buttons, and the display of a selection of sizes. Sizes are pixels of the 1920
// raster. Pure functions; any thread.
namespace SizeLadder
{

constexpr int MAXSIZE = 999;
constexpr int MINSIZE = 20;

// Returns the sizes of the drop-down list.
const QList<int>& comboBoxSizes();
// Returns all steps in ascending order.
const QList<int>& totalSizes();

// Returns the first step above the value; 999 for 999. The value need not be a step.
int getNextData(int value);
// Returns the last step below the value; 20 for 20.
int getPreviousData(int value);

bool allIsMin(const QList<int>& sizes);
bool allIsMax(const QList<int>& sizes);
// Returns the smallest size, 0 if there is none.
int getMinSize(const QList<int>& sizes);
// Returns the size when all are equal, otherwise the smallest one and a plus sign; empty if there is none.
QString displayText(const QList<int>& sizes);

} // namespace SizeLadder
