#pragma once

#include "platform/framework/module.h"

// The plug-in's module: the token of its classes and the way to its resources. Never exported, so that two
// plug-ins with such a function do not meet.
const kota::Module& kota0AdModule();
