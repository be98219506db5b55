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

// Handles this process holds, counted in the system's handle table (the
// count that GetProcessHandleCount would give, which Wine does not report),
// or -1 if the table cannot be read.
inline long long OpenHandleCount() {
    struct Entry {
        USHORT processId;
        USHORT creatorBackTraceIndex;
        UCHAR objectType;
        UCHAR attributes;
        USHORT handle;
        PVOID object;
        ACCESS_MASK access;
    };
    struct Table {
        ULONG count;
        Entry entries[1];
    };
    using Query = NTSTATUS(NTAPI*)(ULONG, PVOID, ULONG, PULONG);
    static const Query query = reinterpret_cast<Query>(reinterpret_cast<void*>(
        GetProcAddress(GetModuleHandleW(L"ntdll.dll"), "NtQuerySystemInformation")));
    if (query == nullptr) return -1;
    constexpr ULONG kSystemHandleInformation = 16;
    constexpr NTSTATUS kInfoLengthMismatch = static_cast<NTSTATUS>(0xC0000004L);
    std::vector<unsigned char> buffer(1 << 20);
    NTSTATUS status;
    ULONG needed = 0;
    while ((status = query(kSystemHandleInformation, buffer.data(),
                           static_cast<ULONG>(buffer.size()), &needed)) == kInfoLengthMismatch)
        buffer.resize(buffer.size() * 2);
    if (status != 0) return -1;
    const auto* table = reinterpret_cast<const Table*>(buffer.data());
    const auto self = static_cast<USHORT>(GetCurrentProcessId());
    long long count = 0;
    for (ULONG i = 0; i < table->count; ++i)
        if (table->entries[i].processId == self) ++count;
    return count;
}

}  // namespace probe

#endif  // VANTORBASE_TESTS_PROCESS_PROBE_H
