#pragma once

#include <QList>
#include <QString>

// The steps that the two size buttons take, and what a selection of sizes looks like. Sizes are pixels of the
// 1920 raster. Pure functions; any thread.
namespace SizeLadder
{

constexpr int MAXSIZE = 999;
constexpr int MINSIZE = 20;

// What the drop-down offers.
const QList<int>& comboBoxSizes();
// The ladder.
const QList<int>& totalSizes();

// The first step above the value; 999 stays. A value off the ladder joins it.
int getNextData(int value);
// The step before the first one that is not below the value; 20 stays.
int getPreviousData(int value);

bool allIsMin(const QList<int>& sizes);
bool allIsMax(const QList<int>& sizes);
// The smallest size, 0 without any.
int getMinSize(const QList<int>& sizes);
// The one size, or the smallest one and a plus sign; empty without any.
QString displayText(const QList<int>& sizes);

} // namespace SizeLadder
