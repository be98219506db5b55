#include <stdexcept>

#include "vantorbase/thread.h"

namespace {

const wchar_t* RequireMessage(const wchar_t* message) {
    if (message == nullptr) throw std::invalid_argument("ThreadException: null message text");
    return message;
}

}  // namespace

ThreadException::ThreadException(const wchar_t* message) : m_message(RequireMessage(message)) {}
ThreadException::ThreadException(const ThreadException& other) = default;
ThreadException& ThreadException::operator=(const ThreadException& other) = default;
ThreadException::~ThreadException() = default;

std::wstring ThreadException::getMessage() const { return m_message; }
