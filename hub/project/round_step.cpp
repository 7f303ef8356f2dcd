#include "hub/project/round_step.h"

#include <cmath>
#include <initializer_list>

namespace kota::hub {

double roundStep(double length) {
    if (!(length > 1))
        return 1;
    const double power = std::pow(10, std::floor(std::log10(length)));
    for (const double digit : {1.0, 2.0, 5.0})
        if (digit * power >= length)
            return digit * power;
    return 10 * power;
}

} // namespace kota::hub
