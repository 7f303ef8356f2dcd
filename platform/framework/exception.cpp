#include "platform/framework/exception.h"

CInvalidArgException::CInvalidArgException(const char* what) : std::invalid_argument(what) {}
CInvalidArgException::CInvalidArgException(const CInvalidArgException& other) = default;
CInvalidArgException::~CInvalidArgException() = default;

void AfxThrowInvalidArgException(const char* what) {
    throw CInvalidArgException(what);
}
