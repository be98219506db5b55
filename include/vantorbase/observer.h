// VantorBase: observers and subjects.
//
// A Subject keeps an ordered list of Observers and, when told to Notify,
// calls each one's Update synchronously on the calling thread, in order of
// attachment. Every observer (and so every subject) is also a Property store.
//
//   class Meter : public Observer {
//   public:
//       void Update(Subject* subject) override { /* read the subject */ }
//   };
//   Model model;
//   Meter meter;
//   model.Attach(&meter);
//   model.Notify();          // meter.Update(&model)
//   model.Detach(&meter);
//
// The list does not own its observers: detach an observer from every subject
// before destroying it. An Update may attach and detach observers (itself
// included) and may notify again; the walk stays valid. Copies of a subject
// share its store and its observer list.
#ifndef VANTORBASE_OBSERVER_H
#define VANTORBASE_OBSERVER_H

#include <memory>
#include <string>

#include "vantorbase/export.h"
#include "vantorbase/property.h"

VANTORBASE_SUPPRESS_DLL_INTERFACE_WARNINGS

namespace vantorbase::detail {
class ObserverList;
}

class Subject;

// The interface through which a subject notifies. Copies share the store.
class VANTORBASE_API Observer : public Property {
public:
    Observer();
    Observer(const Observer& other);
    Observer& operator=(const Observer& other);

    // Called by a subject's Notify with the notifying subject (or the
    // argument given to Notify(Subject*)).
    virtual void Update(Subject* subject) = 0;

    // Virtual, so that deleting through a base pointer reaches the
    // most-derived class. Does not detach the observer from any subject.
    virtual ~Observer();
};

// An observer that others can observe. Copies share the store and the list.
class VANTORBASE_API Subject : public Observer {
public:
    Subject();
    Subject(const Subject& other);
    Subject& operator=(const Subject& other);
    // Frees the list (when no copy shares it); the observers are not told.
    ~Subject() override;

    // Ignores the call.
    void Update(Subject* subject) override;

    // Calls Update(subject) on every listed observer, in order of
    // attachment. An observer attached during the walk is reached later in
    // the same walk; one detached before the walk reaches it is not called.
    // An exception from an Update ends the walk, is consumed, and writes
    // "\nObserver Notify Exception!!!" once to the debugger output.
    virtual void Notify(Subject* subject);
    // Notify(this).
    virtual void Notify();

    // Appends the observer unless it is null or already listed.
    void Attach(Observer* observer);
    // Removes the observer if it is listed; safe from inside an Update.
    void Detach(Observer* observer);
    // Whether the observer is listed.
    bool IsExist(Observer* observer);
    // The observer at a position from 0, or null outside the list.
    Observer* GetObserver(int position);
    // The number of listed observers.
    int GetObserverCount();

    // The qualified name of the object's most-derived class, without any
    // keyword: "Model", "app::VolumeCommand".
    std::string GetSubjectName();
    // GetSubjectName converted with string2wstring.
    std::wstring GetSubjectNameW();

private:
    std::shared_ptr<vantorbase::detail::ObserverList> m_observers;
};

VANTORBASE_RESTORE_WARNINGS

#endif  // VANTORBASE_OBSERVER_H
