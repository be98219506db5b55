// Library-wide state kept by the foundation layer and shared by the others.
#ifndef VANTORBASE_SRC_FOUNDATION_LIBRARY_STATE_H
#define VANTORBASE_SRC_FOUNDATION_LIBRARY_STATE_H

namespace vantorbase::detail {

// The initialised flag: false when the library is loaded; set once the
// library has made its hidden window, cleared when the library shuts down.
// While it is set, PropertyException writes its banner to the debugger.
bool IsLibraryInitialized() noexcept;
void SetLibraryInitialized(bool initialized) noexcept;

}  // namespace vantorbase::detail

#endif  // VANTORBASE_SRC_FOUNDATION_LIBRARY_STATE_H
