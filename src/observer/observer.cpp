#include "vantorbase/observer.h"

#include <typeinfo>

#if defined(__GNUC__)
#include <cxxabi.h>
#include <cstdlib>
#endif

#include "foundation/debug_output.h"
#include "foundation/text_values.h"
#include "observer/observer_list.h"

using vantorbase::detail::ObserverList;

Observer::Observer() = default;
Observer::Observer(const Observer& other) = default;
Observer& Observer::operator=(const Observer& other) = default;
Observer::~Observer() = default;

Subject::Subject() : m_observers(std::make_shared<ObserverList>()) {}
Subject::Subject(const Subject& other) = default;
Subject& Subject::operator=(const Subject& other) {
    Observer::operator=(other);
    m_observers = other.m_observers;
    return *this;
}
Subject::~Subject() = default;

void Subject::Update(Subject*) {}

void Subject::Notify(Subject* subject) {
    // The walk holds the list, so an Update that destroys or reassigns this
    // subject cannot free it under the walk.
    const std::shared_ptr<ObserverList> list = m_observers;
    if (!list->Walk(subject))
        vantorbase::detail::WriteDebugOutput(L"\nObserver Notify Exception!!!");
}

void Subject::Notify() { Notify(this); }

void Subject::Attach(Observer* observer) { m_observers->Attach(observer); }
void Subject::Detach(Observer* observer) { m_observers->Detach(observer); }
bool Subject::IsExist(Observer* observer) { return m_observers->Contains(observer); }
Observer* Subject::GetObserver(int position) { return m_observers->At(position); }
int Subject::GetObserverCount() { return m_observers->Count(); }

std::string Subject::GetSubjectName() {
    const char* raw = typeid(*this).name();
#if defined(__GNUC__)
    int status = 0;
    char* demangled = abi::__cxa_demangle(raw, nullptr, nullptr, &status);
    if (status == 0 && demangled != nullptr) {
        std::string name(demangled);
        std::free(demangled);
        return name;
    }
    std::free(demangled);
    return raw;
#else
    std::string name(raw);
    for (const char* keyword : {"class ", "struct "}) {
        const std::string prefix(keyword);
        if (name.compare(0, prefix.size(), prefix) == 0) return name.substr(prefix.size());
    }
    return name;
#endif
}

std::wstring Subject::GetSubjectNameW() { return vantorbase::detail::Widen(GetSubjectName()); }
