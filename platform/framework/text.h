#pragma once

#include "platform/framework/export.h"

#include <cstdarg>
#include <cstddef>
#include <iosfwd>
#include <string_view>

// A text of 8-bit characters, UTF-8 by convention and never checked: any bytes may stand in it, NUL
// included. A value: copies share their bytes until one of them is changed. Nothing that allocates is inline,
// so that a text made in one library may be changed and destroyed in another. Where one is passed by value,
// both sides must be built on the same SDK (kota::abiVersion).
class KOTA_API CString {
public:
    CString() noexcept {}
    // A null pointer gives the empty text.
    CString(const char* text);
    explicit CString(std::string_view text);
    CString(const CString& other);
    CString(CString&& other) noexcept : bytes_(other.bytes_) { other.bytes_ = nullptr; }
    ~CString() {
        if (bytes_)
            Release(bytes_);
    }

    CString& operator=(const CString& other);
    CString& operator=(CString&& other) noexcept;
    CString& operator=(const char* text);
    CString& operator=(std::string_view text);

    // Length in bytes.
    int GetLength() const;
    bool IsEmpty() const;
    void Empty();

    // The bytes, ended by a NUL, valid until the text changes.
    operator const char*() const;
    std::string_view View() const;

    CString& operator+=(const CString& tail);
    CString& operator+=(const char* tail);
    CString& operator+=(char tail);

    // Below 0, 0 or above 0, by unsigned bytes.
    int Compare(const CString& other) const;

    // Replaces the text by `format` filled in as the C library's printf does.
    [[gnu::format(printf, 2, 3)]] void Format(const char* format, ...);
    [[gnu::format(printf, 2, 0)]] void FormatV(const char* format, std::va_list arguments);

private:
    struct Bytes;

    static void Release(Bytes* bytes);
    void Append(std::string_view tail);

    Bytes* bytes_ = nullptr; // shared with the copies; null for the empty text
};

KOTA_API bool operator==(const CString& left, const CString& right);
KOTA_API bool operator==(const CString& left, const char* right);
KOTA_API bool operator<(const CString& left, const CString& right);
KOTA_API CString operator+(const CString& left, const CString& right);
KOTA_API CString operator+(const CString& left, const char* right);
KOTA_API CString operator+(const char* left, const CString& right);
KOTA_API std::ostream& operator<<(std::ostream& stream, const CString& text);
