#include "bench/Statistics.h"

#include <algorithm>
#include <cmath>

double Statistics::median(std::vector<double> values)
{
    if (values.empty())
        return 0;
    std::sort(values.begin(), values.end());
    const std::size_t middle = values.size() / 2;
    return values.size() % 2 == 1 ? values[middle] : (values[middle - 1] + values[middle]) / 2;
}

double Statistics::spread(const std::vector<double>& values)
{
    const double middle = median(values);
    if (middle == 0)
        return 0;
    const auto [lowest, highest] = std::minmax_element(values.begin(), values.end());
    return (*highest - *lowest) / middle;
}

// The slope of the straight line through the logarithms, by least squares.
double Statistics::growthExponent(const std::vector<std::pair<double, double>>& points)
{
    double count = 0;
    double sumX = 0;
    double sumY = 0;
    double sumXX = 0;
    double sumXY = 0;
    for (const auto& [size, time] : points) {
        if (size <= 0 || time <= 0)
            continue;
        const double x = std::log(size);
        const double y = std::log(time);
        ++count;
        sumX += x;
        sumY += y;
        sumXX += x * x;
        sumXY += x * y;
    }
    constexpr double LEAST_WIDTH = 1e-9;
    const double width = count * sumXX - sumX * sumX;
    return width > LEAST_WIDTH ? (count * sumXY - sumX * sumY) / width : 0;
}
