#pragma once

#include "platform/framework/text.h"

// The parts of a file's path. Put one after the other they are the path again.
struct PathParts {
    CString drive;     // always empty where paths have none
    CString directory; // with its closing separator
    CString fileName;  // without extension
    CString extension; // with its dot, empty when there is none
};

// Splits a path at its last separator and its name at the last dot. A dot that begins the name begins an
// extension too.
KOTA_API PathParts SplitPath(const char* path);
