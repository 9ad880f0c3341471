#include "panel/SizeLadder.h"

#include <algorithm>

namespace
{

bool allAre(const QList<int>& sizes, int value)
{
    return std::all_of(sizes.begin(), sizes.end(), [value](int size) { return size == value; });
}

} // namespace

const QList<int>& SizeLadder::comboBoxSizes()
{
    static const QList<int> sizes{32, 36, 40, 44, 48, 54, 60, 64, 66, 72, 80, 88, 96};
    return sizes;
}

const QList<int>& SizeLadder::totalSizes()
{
    static const QList<int> sizes{20, 24,  28,  32,  36,  40,  44,  48,  54,  60,  64,  66,  72,  80, 88,
                                  96, 115, 138, 166, 199, 239, 287, 344, 413, 496, 595, 714, 857, 999};
    return sizes;
}

int SizeLadder::getNextData(int value)
{
    const QList<int>& ladder = totalSizes();
    const auto next = std::upper_bound(ladder.begin(), ladder.end(), value);
    return next == ladder.end() ? MAXSIZE : *next;
}

int SizeLadder::getPreviousData(int value)
{
    const QList<int>& ladder = totalSizes();
    const auto notBelow = std::lower_bound(ladder.begin(), ladder.end(), value);
    return notBelow == ladder.begin() ? MINSIZE : *std::prev(notBelow);
}

bool SizeLadder::allIsMin(const QList<int>& sizes)
{
    return allAre(sizes, MINSIZE);
}

bool SizeLadder::allIsMax(const QList<int>& sizes)
{
    return allAre(sizes, MAXSIZE);
}

int SizeLadder::getMinSize(const QList<int>& sizes)
{
    return sizes.isEmpty() ? 0 : *std::min_element(sizes.begin(), sizes.end());
}

QString SizeLadder::displayText(const QList<int>& sizes)
{
    if (sizes.isEmpty())
        return QString();
    const bool mixed = !allAre(sizes, sizes.constFirst());
    return mixed ? QString::number(getMinSize(sizes)) + QLatin1Char('+')
                 : QString::number(sizes.constFirst());
}
