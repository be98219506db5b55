// The observer list that a subject and its copies share.
#ifndef VANTORBASE_SRC_OBSERVER_OBSERVER_LIST_H
#define VANTORBASE_SRC_OBSERVER_OBSERVER_LIST_H

#include <cstddef>
#include <unordered_map>
#include <vector>

class Observer;
class Subject;

namespace vantorbase::detail {

// Observers in order of attachment. A detached observer leaves a null entry
// behind while a notification walk is running, so that the walk's position
// stays valid; null entries are compacted away once no walk runs and they
// make up half the list, which keeps Attach and Detach amortised O(1).
class ObserverList {
public:
    void Attach(Observer* observer);
    void Detach(Observer* observer);
    bool Contains(Observer* observer) const { return m_positions.count(observer) != 0; }
    Observer* At(int position);
    int Count() const noexcept { return static_cast<int>(m_positions.size()); }

    // Calls Update(argument) on every entry, including those appended during
    // the walk; returns false if an Update threw (the walk then stopped).
    bool Walk(Subject* argument);

private:
    void CompactIfWorthIt();
    void Compact();

    std::vector<Observer*> m_entries;
    std::unordered_map<Observer*, size_t> m_positions;
    size_t m_dead = 0;
    int m_walks = 0;
};

}  // namespace vantorbase::detail

#endif  // VANTORBASE_SRC_OBSERVER_OBSERVER_LIST_H
