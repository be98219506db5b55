#include "vantorbase/text.h"

#include <windows.h>

#include <cstring>
#include <cwchar>
#include <memory>
#include <new>

namespace {

// Short texts convert through a buffer on the stack; longer ones through a
// heap buffer whose allocation may fail without throwing.
constexpr int kStackChars = 256;

template <typename Char>
class ScratchBuffer {
public:
    explicit ScratchBuffer(int chars) {
        if (chars <= kStackChars) {
            data_ = stack_;
        } else {
            heap_.reset(new (std::nothrow) Char[static_cast<size_t>(chars)]);
            data_ = heap_.get();
        }
    }
    Char* get() const noexcept { return data_; }

private:
    Char stack_[kStackChars];
    std::unique_ptr<Char[]> heap_;
    Char* data_ = nullptr;
};

}  // namespace

void string2wstring(std::wstring& out, const std::string& in) {
    const int needed = MultiByteToWideChar(CP_ACP, 0, in.c_str(), -1, nullptr, 0);
    if (needed <= 0) {
        out.clear();
        return;
    }
    ScratchBuffer<wchar_t> buffer(needed);
    if (buffer.get() == nullptr) return;
    if (MultiByteToWideChar(CP_ACP, 0, in.c_str(), -1, buffer.get(), needed) <= 0) {
        out.clear();
        return;
    }
    out.assign(buffer.get(), std::wcslen(buffer.get()));
}

void wstring2string(std::string& out, const std::wstring& in) {
    const int needed =
        WideCharToMultiByte(CP_ACP, 0, in.c_str(), -1, nullptr, 0, nullptr, nullptr);
    if (needed <= 0) {
        out.clear();
        return;
    }
    ScratchBuffer<char> buffer(needed);
    if (buffer.get() == nullptr) return;
    if (WideCharToMultiByte(CP_ACP, 0, in.c_str(), -1, buffer.get(), needed, nullptr,
                            nullptr) <= 0) {
        out.clear();
        return;
    }
    out.assign(buffer.get(), std::strlen(buffer.get()));
}
