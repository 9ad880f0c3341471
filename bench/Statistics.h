#pragma once

#include <utility>
#include <vector>

// The figures that repeated measurements are reduced to.
namespace Statistics
{

// Returns the middle value, or the mean of the two middle ones; 0 without values.
double median(std::vector<double> values);

// Returns the distance from the lowest to the highest value as a share of the median; 0 without values or for
// a median of 0.
double spread(const std::vector<double>& values);

// Returns the exponent of the power of the size that comes closest to the times: 0 for a time that does not
// depend on the size, 1 for one in proportion to it. Points (size, time) that are not positive are left out.
// Returns 0 when there are fewer than two sizes.
double growthExponent(const std::vector<std::pair<double, double>>& points);

} // namespace Statistics
