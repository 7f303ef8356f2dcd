#include "platform/framework/text.h"

#include <algorithm>
#include <atomic>
#include <cstdarg>
#include <cstdint>
#include <cstdio>
#include <new>
#include <ostream>
#include <stdexcept>
#include <string>
#include <utility>

// The bytes of a text, ended by a NUL, in one piece behind this head.
struct CString::Bytes {
    std::atomic<std::uint32_t> users;
    std::uint32_t length;
    std::uint32_t capacity;

    char* text() { return reinterpret_cast<char*>(this + 1); }

    static Bytes* make(std::string_view text, std::size_t capacity) {
        if (capacity >= UINT32_MAX)
            throw std::length_error("a text of more than 4 GiB");
        void* const room = ::operator new(sizeof(Bytes) + capacity + 1);
        auto* bytes = new (room) Bytes{1, 0, static_cast<std::uint32_t>(capacity)};
        bytes->append(text);
        return bytes;
    }

    // Within the capacity.
    void append(std::string_view tail) {
        std::copy(tail.begin(), tail.end(), text() + length);
        length += static_cast<std::uint32_t>(tail.size());
        text()[length] = '\0';
    }

    static Bytes* share(Bytes* bytes) {
        if (bytes)
            bytes->users.fetch_add(1, std::memory_order_relaxed);
        return bytes;
    }
};

CString::CString(const char* text) : CString(std::string_view(text ? text : "")) {}
CString::CString(std::string_view text) : bytes_(text.empty() ? nullptr : Bytes::make(text, text.size())) {}
CString::CString(const CString& other) : bytes_(Bytes::share(other.bytes_)) {}

void CString::Release(Bytes* bytes) {
    if (!bytes || bytes->users.fetch_sub(1, std::memory_order_acq_rel) > 1)
        return;
    bytes->~Bytes();
    ::operator delete(bytes);
}

CString& CString::operator=(const CString& other) {
    Release(std::exchange(bytes_, Bytes::share(other.bytes_)));
    return *this;
}

CString& CString::operator=(CString&& other) noexcept {
    std::swap(bytes_, other.bytes_);
    return *this;
}

CString& CString::operator=(const char* text) {
    return *this = CString(text);
}
CString& CString::operator=(std::string_view text) {
    return *this = CString(text);
}

int CString::GetLength() const {
    return bytes_ ? static_cast<int>(bytes_->length) : 0;
}
bool CString::IsEmpty() const {
    return GetLength() == 0;
}
void CString::Empty() {
    *this = CString();
}
CString::operator const char*() const {
    return bytes_ ? bytes_->text() : "";
}
std::string_view CString::View() const {
    return bytes_ ? std::string_view(bytes_->text(), bytes_->length) : std::string_view();
}

CString& CString::operator+=(const CString& tail) {
    Append(tail.View());
    return *this;
}

CString& CString::operator+=(const char* tail) {
    Append(tail ? tail : "");
    return *this;
}

CString& CString::operator+=(char tail) {
    Append({&tail, 1});
    return *this;
}

void CString::Append(std::string_view tail) {
    const std::size_t length = View().size() + tail.size();
    const bool inPlace =
        bytes_ && bytes_->users.load(std::memory_order_acquire) == 1 && length <= bytes_->capacity;
    if (!inPlace) {
        // `tail` may be a part of this text, so the old bytes stay until it is appended.
        Bytes* const grown = Bytes::make(View(), std::max(length, View().size() * 2));
        grown->append(tail);
        Release(std::exchange(bytes_, grown));
    } else {
        bytes_->append(tail);
    }
}

int CString::Compare(const CString& other) const {
    return View().compare(other.View());
}

void CString::Format(const char* format, ...) {
    va_list arguments;
    va_start(arguments, format);
    FormatV(format, arguments);
    va_end(arguments);
}

void CString::FormatV(const char* format, va_list arguments) {
    va_list again;
    va_copy(again, arguments);
    const int length = std::vsnprintf(nullptr, 0, format, arguments);
    // Filled into a text of its own, since an argument may point into this one.
    std::string filled(length > 0 ? static_cast<std::size_t>(length) : 0, '\0');
    std::vsnprintf(filled.data(), filled.size() + 1, format, again);
    va_end(again);
    *this = std::string_view(filled);
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
