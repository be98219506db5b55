// Measures what a process holds: the live bytes of the C runtime heap and the
// number of open handles. Used by tests that check that repeated work leaks
// neither memory nor handles.
#ifndef VANTORBASE_TESTS_PROCESS_PROBE_H
#define VANTORBASE_TESTS_PROCESS_PROBE_H

#include <windows.h>
#include <malloc.h>
#include <winternl.h>

#include <cstddef>
#include <vector>

namespace probe {

// Bytes in use on the C runtime heap, which the library and the program share
// (both allocate through msvcrt), or -1 if the heap cannot be walked.
inline long long LiveHeapBytes() {
    _HEAPINFO info{};
    info._pentry = nullptr;
    long long used = 0;
    int status;
    while ((status = _heapwalk(&info)) == _HEAPOK)
        if (info._useflag == _USEDENTRY) used += static_cast<long long>(info._size);
    return status == _HEAPEND ? used : -1;
}

namespace detail {

// One entry of the system's handle table.
struct HandleEntry {
    ULONG processId;
    UCHAR objectType;
    UCHAR attributes;
    USHORT handle;
    PVOID object;
    ACCESS_MASK access;
};

// The entries of the system's handle table that belong to this process, or
// false if the table cannot be read.
inline bool OwnHandles(std::vector<HandleEntry>& own) {
    struct Table {
        ULONG count;
        HandleEntry entries[1];
    };
    using Query = NTSTATUS(NTAPI*)(ULONG, PVOID, ULONG, PULONG);
    static const Query query = reinterpret_cast<Query>(reinterpret_cast<void*>(
        GetProcAddress(GetModuleHandleW(L"ntdll.dll"), "NtQuerySystemInformation")));
    if (query == nullptr) return false;
    constexpr ULONG kSystemHandleInformation = 16;
    constexpr NTSTATUS kInfoLengthMismatch = static_cast<NTSTATUS>(0xC0000004L);
    std::vector<unsigned char> buffer(1 << 20);
    NTSTATUS status;
    ULONG needed = 0;
    while ((status = query(kSystemHandleInformation, buffer.data(),
                           static_cast<ULONG>(buffer.size()), &needed)) == kInfoLengthMismatch)
        buffer.resize(buffer.size() * 2);
    if (status != 0) return false;
    const auto* table = reinterpret_cast<const Table*>(buffer.data());
    // The process id field is 16 bits wide on some systems; the high half
    // is then another field, so only the low half is compared.
    const auto self = static_cast<USHORT>(GetCurrentProcessId());
    own.clear();
    for (ULONG i = 0; i < table->count; ++i)
        if (static_cast<USHORT>(table->entries[i].processId) == self) own.push_back(table->entries[i]);
    return true;
}

}  // namespace detail

// Handles this process holds, counted in the system's handle table (the
// count that GetProcessHandleCount would give, which Wine does not report),
// or -1 if the table cannot be read.
inline long long OpenHandleCount() {
    std::vector<detail::HandleEntry> own;
    return detail::OwnHandles(own) ? static_cast<long long>(own.size()) : -1;
}

// Mutex handles this process holds, or -1 if the table cannot be read.
// Counting one kind of object keeps handles that the process's own start-up
// opens meanwhile out of the figure.
inline long long OpenMutexHandleCount() {
    // A mutex of our own shows which object type mutexes have.
    const HANDLE marker = CreateMutexW(nullptr, FALSE, nullptr);
    std::vector<detail::HandleEntry> own;
    const bool read = detail::OwnHandles(own);
    CloseHandle(marker);
    if (!read) return -1;
    const auto markerValue = static_cast<USHORT>(reinterpret_cast<ULONG_PTR>(marker));
    int mutexType = -1;
    for (const auto& entry : own)
        if (entry.handle == markerValue) mutexType = entry.objectType;
    if (mutexType < 0) return -1;
    long long count = -1;  // the marker itself
    for (const auto& entry : own)
        if (entry.objectType == mutexType) ++count;
    return count;
}

}  // namespace probe

#endif  // VANTORBASE_TESTS_PROCESS_PROBE_H
