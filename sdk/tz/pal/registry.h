#pragma once

#include <cstdint>

#include "tz/export.h"
#include "tz/text/string.h"

// Named values under keys, which the user sets outside the program. Here they come from the
// settings.
//
//   CTwUiRegistryAccess fonts;
//   if (fonts.Open(HKEY_LOCAL_MACHINE, L"SOFTWARE\\Fonts")) name = fonts.GetString(L"Arial");
//
// Names count without case. Types: 1 a text, 4 a 32-bit number. [any]

enum HKEY : std::uint32_t {
    HKEY_CURRENT_USER = 0x80000001,
    HKEY_LOCAL_MACHINE = 0x80000002,
};

constexpr std::uint32_t REG_SZ = 1;
constexpr std::uint32_t REG_DWORD = 4;

class TZ_API CTwUiRegistryAccess {
public:
    CTwUiRegistryAccess() = default;
    virtual ~CTwUiRegistryAccess() = default;

    // Opens a key and closes the previous one; false when there is no such key. An empty path is
    // the root itself.
    virtual bool Open(HKEY root, wchar_t const* path);
    virtual void Close();
    [[nodiscard]] bool IsOpen() const { return isOpen_; }

    // The value of that name as text; empty when there is no such value or it is no text.
    [[nodiscard]] TzString GetString(wchar_t const* name) const;
    // The value of that name: false when there is none. `value` is set for type 4 alone.
    [[nodiscard]] bool
    GetDword(wchar_t const* name, std::uint32_t& value, std::uint32_t& type) const;
    // Name and type of the value at `index`, from 0; false after the last.
    [[nodiscard]] bool EnumValueNames(int index, TzString& name, std::uint32_t& type) const;

private:
    TzString key_;  // root and path
    bool isOpen_ = false;
};
