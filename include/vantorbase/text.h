// VantorBase: conversion between narrow and wide text.
//
// Narrow text is a std::string of bytes in the system ANSI code page; wide
// text is a std::wstring of UTF-16. Every place where the library turns one
// form into the other goes through these two functions.
#ifndef VANTORBASE_TEXT_H
#define VANTORBASE_TEXT_H

#include <string>

#include "vantorbase/export.h"

// Replaces `out` with `in` converted from the ANSI code page to UTF-16.
// Conversion stops at the first NUL character of `in`. An empty input, or one
// the system cannot convert, leaves `out` empty. If no memory can be had for
// the conversion, `out` is left unchanged. Throws nothing of its own.
VANTORBASE_API void string2wstring(std::wstring& out, const std::string& in);

// Replaces `out` with `in` converted from UTF-16 to the ANSI code page.
// Characters the code page cannot represent become its default character;
// no error is reported. Otherwise behaves as string2wstring.
VANTORBASE_API void wstring2string(std::string& out, const std::wstring& in);

#endif  // VANTORBASE_TEXT_H
