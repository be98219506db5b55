#include <stdexcept>
#include <string>

#include "system/handle.h"
#include "vantorbase/mutex.h"
#include "vantorbase/thread.h"

namespace vantorbase::detail {

// The handle and name that all copies of one Mutex share.
struct MutexState {
    UniqueHandle handle;
    std::wstring name;

    // The last copy leaves the handle open on purpose: the named mutex stays
    // in existence until the process ends unless Mutex::release closed it.
    ~MutexState() { handle.detach(); }
};

}  // namespace vantorbase::detail

namespace {

const wchar_t* RequireName(const wchar_t* name, const char* operation) {
    if (name == nullptr) throw std::invalid_argument(std::string(operation) + ": null name");
    return name;
}

// Creates the named mutex, or opens it if it exists; the caller does not
// take it.
HANDLE CreateNamedMutex(const std::wstring& name) {
    return CreateMutexW(nullptr, FALSE, name.c_str());
}

}  // namespace

Mutex::Mutex() : m_state(std::make_shared<vantorbase::detail::MutexState>()) {}

Mutex::Mutex(const wchar_t* name) : m_state(std::make_shared<vantorbase::detail::MutexState>()) {
    m_state->name = RequireName(name, "Mutex::Mutex");
    m_state->handle.reset(CreateNamedMutex(m_state->name));
    if (!m_state->handle) throw ThreadException(L"Failed to create mutex");
}

Mutex::Mutex(const Mutex& other) = default;
Mutex& Mutex::operator=(const Mutex& other) = default;
Mutex::~Mutex() = default;

void Mutex::create(const wchar_t* name) {
    std::wstring newName = RequireName(name, "Mutex::create");
    m_state->handle.reset();
    m_state->name.swap(newName);
    m_state->handle.reset(CreateNamedMutex(m_state->name));
    if (!m_state->handle) throw ThreadException(L"Failed to create mutex");
}

unsigned long* Mutex::getMutexHandle() {
    return reinterpret_cast<unsigned long*>(m_state->handle.get());
}

std::wstring Mutex::getName() { return m_state->name; }

void Mutex::release() { m_state->handle.reset(); }
