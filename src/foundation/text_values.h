// Value-returning forms of the text conversion, for the library's own use.
#ifndef VANTORBASE_SRC_FOUNDATION_TEXT_VALUES_H
#define VANTORBASE_SRC_FOUNDATION_TEXT_VALUES_H

#include <string>

#include "vantorbase/text.h"

namespace vantorbase::detail {

inline std::wstring Widen(const std::string& narrow) {
    std::wstring wide;
    string2wstring(wide, narrow);
    return wide;
}

inline std::string Narrow(const std::wstring& wide) {
    std::string narrow;
    wstring2string(narrow, wide);
    return narrow;
}

}  // namespace vantorbase::detail

#endif  // VANTORBASE_SRC_FOUNDATION_TEXT_VALUES_H
