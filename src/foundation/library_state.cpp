#include "foundation/library_state.h"

#include <atomic>

namespace vantorbase::detail {
namespace {

// Written by the window thread, read by any thread that throws a
// PropertyException; atomic so that such a read is never a data race.
std::atomic<bool> g_initialized{false};

}  // namespace

bool IsLibraryInitialized() noexcept { return g_initialized.load(std::memory_order_relaxed); }

void SetLibraryInitialized(bool initialized) noexcept {
    g_initialized.store(initialized, std::memory_order_relaxed);
}

}  // namespace vantorbase::detail
