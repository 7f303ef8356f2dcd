#pragma once

namespace kota::hub {

// The smallest of 1, 2, 5, 10, 20, 50, ... that is not less than a length; 1 for lengths below it.
double roundStep(double length);

} // namespace kota::hub
