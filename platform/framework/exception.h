#pragma once

#include "platform/framework/export.h"

#include <stdexcept>

// The invalid-argument failure: an operation was given a list position, a place or an index that does not
// exist. The system never catches it; each dispatch of a message does, tells the user and goes on.
class KOTA_API CInvalidArgException : public std::invalid_argument {
public:
    explicit CInvalidArgException(const char* what);
    CInvalidArgException(const CInvalidArgException& other);
    ~CInvalidArgException() override;
};

// Throws a CInvalidArgException that names the operation and what it was given.
[[noreturn]] KOTA_API void AfxThrowInvalidArgException(const char* what);
