// VantorBase: named system mutexes.
//
// A Mutex makes a named system mutex exist and keeps it open while threads
// take and give it back by name with Thread::wait and Thread::release:
//
//   Mutex guard(L"Playlist");            // creates or opens "Playlist"
//   // on any thread:
//   if (worker.wait(L"Playlist", 1000)) { /* ... */ worker.release(L"Playlist"); }
//   guard.release();                      // closes the handle
//
// Mutex has no lock operation of its own.
#ifndef VANTORBASE_MUTEX_H
#define VANTORBASE_MUTEX_H

#include <memory>
#include <string>

#include "vantorbase/export.h"

VANTORBASE_SUPPRESS_DLL_INTERFACE_WARNINGS

namespace vantorbase::detail {
struct MutexState;
}

// The owner of one handle to a named system mutex and of its name.
//
// Copies share: a copy (and an assignment) refers to the same handle and
// name as its source, so create or release through any of them is seen
// through all, and the handle is closed once.
//
// The destructor does not close the handle: a named mutex may be meant to
// outlive its object. Call release first; a handle left open keeps the
// system mutex in existence until the process ends.
class VANTORBASE_API Mutex {
public:
    // No handle; an empty name.
    Mutex();
    // Stores the name and creates the named mutex, or opens it if it exists
    // already; the creating thread does not take it. Raises ThreadException
    // "Failed to create mutex" (for instance when the name belongs to
    // another kind of system object). Throws std::invalid_argument if `name`
    // is null.
    explicit Mutex(const wchar_t* name);
    Mutex(const Mutex& other);
    Mutex& operator=(const Mutex& other);
    ~Mutex();

    // Closes the handle held, stores the new name, then creates or opens the
    // named mutex as the constructor does; after "Failed to create mutex" no
    // handle is held and the new name is kept. Throws std::invalid_argument
    // if `name` is null, changing nothing.
    void create(const wchar_t* name);

    // The handle held, or null.
    unsigned long* getMutexHandle();
    std::wstring getName();

    // Closes the handle held, if any. It does not give back a mutex that a
    // thread holds; that is Thread::release.
    void release();

private:
    std::shared_ptr<vantorbase::detail::MutexState> m_state;
};

VANTORBASE_RESTORE_WARNINGS

#endif  // VANTORBASE_MUTEX_H
