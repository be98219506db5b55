#include "foundation/debug_output.h"

#include <windows.h>

namespace vantorbase::detail {

void WriteDebugOutput(const wchar_t* text) noexcept {
    if (text != nullptr) OutputDebugStringW(text);
}

}  // namespace vantorbase::detail
