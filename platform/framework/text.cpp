#include "platform/framework/text.h"

#include <cstdarg>
#include <cstdio>
#include <ostream>

CString::CString() = default;
CString::CString(const char* text) : text_(text ? text : "") {}
CString::CString(std::string_view text) : text_(text) {}
CString::CString(const CString& other) = default;
CString::CString(CString&& other) noexcept = default;
CString::~CString() = default;

CString& CString::operator=(const CString& other) = default;
CString& CString::operator=(CString&& other) noexcept = default;

CString& CString::operator=(const char* text) {
    text_ = text ? text : "";
    return *this;
}

CString& CString::operator=(std::string_view text) {
    text_ = text;
    return *this;
}

int CString::GetLength() const {
    return static_cast<int>(text_.size());
}
bool CString::IsEmpty() const {
    return text_.empty();
}
void CString::Empty() {
    text_.clear();
}
CString::operator const char*() const {
    return text_.c_str();
}
std::string_view CString::View() const {
    return text_;
}

CString& CString::operator+=(const CString& tail) {
    text_ += tail.text_;
    return *this;
}

CString& CString::operator+=(const char* tail) {
    text_ += tail ? tail : "";
    return *this;
}

CString& CString::operator+=(char tail) {
    text_ += tail;
    return *this;
}

int CString::Compare(const CString& other) const {
    return text_.compare(other.text_);
}

void CString::Format(const char* format, ...) {
    va_list arguments;
    va_start(arguments, format);
    va_list again;
    va_copy(again, arguments);
    const int length = std::vsnprintf(nullptr, 0, format, arguments);
    va_end(arguments);
    // Filled into a text of its own, since an argument may point into this one.
    std::string filled(length > 0 ? static_cast<std::size_t>(length) : 0, '\0');
    std::vsnprintf(filled.data(), filled.size() + 1, format, again);
    va_end(again);
    text_ = std::move(filled);
}

bool operator==(const CString& left, const CString& right) {
    return left.View() == right.View();
}
bool operator==(const CString& left, const char* right) {
    return left.View() == (right ? right : "");
}
bool operator<(const CString& left, const CString& right) {
    return left.View() < right.View();
}

CString operator+(const CString& left, const CString& right) {
    CString sum(left);
    sum += right;
    return sum;
}

CString operator+(const CString& left, const char* right) {
    CString sum(left);
    sum += right;
    return sum;
}

CString operator+(const char* left, const CString& right) {
    CString sum(left);
    sum += right;
    return sum;
}

std::ostream& operator<<(std::ostream& stream, const CString& text) {
    return stream << text.View();
}
