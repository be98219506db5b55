// The library's one path to the debugger output.
#ifndef VANTORBASE_SRC_FOUNDATION_DEBUG_OUTPUT_H
#define VANTORBASE_SRC_FOUNDATION_DEBUG_OUTPUT_H

namespace vantorbase::detail {

// Writes a NUL-terminated wide text to the debugger output. A null text is
// ignored.
void WriteDebugOutput(const wchar_t* text) noexcept;

}  // namespace vantorbase::detail

#endif  // VANTORBASE_SRC_FOUNDATION_DEBUG_OUTPUT_H
