#include "observer/observer_list.h"

#include "vantorbase/observer.h"

namespace vantorbase::detail {

void ObserverList::Attach(Observer* observer) {
    if (observer == nullptr || Contains(observer)) return;
    m_entries.push_back(observer);
    try {
        m_positions.emplace(observer, m_entries.size() - 1);
    } catch (...) {
        m_entries.pop_back();
        throw;
    }
}

void ObserverList::Detach(Observer* observer) {
    const auto it = m_positions.find(observer);
    if (it == m_positions.end()) return;
    m_entries[it->second] = nullptr;
    m_positions.erase(it);
    ++m_dead;
    CompactIfWorthIt();
}

Observer* ObserverList::At(int position) {
    if (position < 0 || position >= Count()) return nullptr;
    if (m_dead == 0) return m_entries[static_cast<size_t>(position)];
    if (m_walks == 0) {
        Compact();
        return m_entries[static_cast<size_t>(position)];
    }
    for (Observer* entry : m_entries)
        if (entry != nullptr && position-- == 0) return entry;
    return nullptr;
}

bool ObserverList::Walk(Subject* argument) {
    // The walk counter keeps entries in place until the outermost walk ends.
    struct WalkScope {
        explicit WalkScope(ObserverList& list) : list(list) { ++list.m_walks; }
        ~WalkScope() {
            if (--list.m_walks == 0) list.CompactIfWorthIt();
        }
        ObserverList& list;
    } scope(*this);
    try {
        for (size_t i = 0; i < m_entries.size(); ++i)
            if (Observer* observer = m_entries[i]) observer->Update(argument);
    } catch (...) {
        return false;
    }
    return true;
}

void ObserverList::CompactIfWorthIt() {
    if (m_walks == 0 && m_dead > 0 && m_dead >= m_positions.size()) Compact();
}

void ObserverList::Compact() {
    size_t kept = 0;
    for (Observer* entry : m_entries) {
        if (entry == nullptr) continue;
        m_entries[kept] = entry;
        m_positions[entry] = kept;
        ++kept;
    }
    m_entries.resize(kept);
    m_dead = 0;
}

}  // namespace vantorbase::detail
