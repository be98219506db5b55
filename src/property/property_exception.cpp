#include <charconv>
#include <stdexcept>

#include "foundation/debug_output.h"
#include "foundation/library_state.h"
#include "foundation/text_values.h"
#include "vantorbase/property.h"

namespace {

const char* RequireOperation(const char* operation) {
    if (operation == nullptr)
        throw std::invalid_argument("PropertyException: null operation text");
    return operation;
}

constexpr wchar_t kBanner[] = L"\n=====================\n";

}  // namespace

PropertyException::PropertyException(const char* operation, const std::string& key)
    : m_message(RequireOperation(operation)) {
    m_message += ", Key= ";
    m_message += key;
    Announce();
}

PropertyException::PropertyException(const char* operation, const std::string& key, int index)
    : m_message(RequireOperation(operation)) {
    char digits[16];
    const auto end = std::to_chars(digits, digits + sizeof digits, index).ptr;
    m_message += ", Key= ";
    m_message += key;
    m_message += ", idx= ";
    m_message.append(digits, end);
    Announce();
}

PropertyException::PropertyException(const PropertyException& other) = default;
PropertyException& PropertyException::operator=(const PropertyException& other) = default;
PropertyException::~PropertyException() = default;

std::string PropertyException::getMessage() const { return m_message; }

std::wstring PropertyException::getMessageW() const { return vantorbase::detail::Widen(m_message); }

// While the library is initialised, the message goes to the debugger output
// between two banners. A message that cannot be widened is written empty.
void PropertyException::Announce() const {
    if (!vantorbase::detail::IsLibraryInitialized()) return;
    std::wstring wide;
    try {
        string2wstring(wide, m_message);
    } catch (...) {
        wide.clear();
    }
    vantorbase::detail::WriteDebugOutput(kBanner);
    vantorbase::detail::WriteDebugOutput(wide.c_str());
    vantorbase::detail::WriteDebugOutput(kBanner);
}
