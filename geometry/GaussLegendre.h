#pragma once

namespace kareport
{

/// Integrates a function over an interval by ten points of Gauss and Legendre: exact to the last digits where the function
/// is smooth and does not turn by more than about one radian in between.
template <typename Function>
auto integrated(double from, double to, const Function &function)
{
    constexpr double nodes[5] = {0.14887433898163122, 0.43339539412924719, 0.67940956829902441, 0.86506336668898451,
                                 0.97390652851717172};
    constexpr double weights[5] = {0.29552422471475287, 0.26926671930999636, 0.21908636251598204, 0.14945134915058059,
                                   0.06667134430868814};
    const double middle = (from + to) / 2;
    const double half = (to - from) / 2;
    auto sum = function(middle - half * nodes[0]);
    sum = (sum + function(middle + half * nodes[0])) * weights[0];
    for (int i = 1; i < 5; ++i) {
        sum = sum + (function(middle - half * nodes[i]) + function(middle + half * nodes[i])) * weights[i];
    }
    return sum * half;
}

} // namespace kareport
