#pragma once

#include "platform/framework/module.h"

// The framework's record of the plug-in's library.
extern AFX_EXTENSION_MODULE kota0AdRecord;

// The plug-in's module: the token of its classes and the way to its resources. Never exported, so that two
// plug-ins with such a function do not meet.
const kota::Module& kota0AdModule();
