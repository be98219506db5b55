// The store that Property objects share: an ordered map from key to slot,
// with a cursor that makes positional enumeration cheap.
#ifndef VANTORBASE_SRC_PROPERTY_PROPERTY_STORE_H
#define VANTORBASE_SRC_PROPERTY_PROPERTY_STORE_H

#include <map>
#include <memory>
#include <string>

#include "vantorbase/property.h"

namespace vantorbase::detail {

class PropertyStore {
public:
    PropertyStore() = default;
    PropertyStore(const PropertyStore&) = delete;
    PropertyStore& operator=(const PropertyStore&) = delete;
    ~PropertyStore() { Clear(); }

    // Replaces the key's value with one of Record's kind, creating the entry
    // if needed. A record of the same kind is updated in place, which is
    // indistinguishable from releasing it and building a new one.
    template <typename Record, typename Value>
    void Write(const std::string& key, const Value& value);

    // Copies the value under the key into `out` if the key holds a record of
    // Record's kind.
    template <typename Record, typename Value>
    bool Read(const std::string& key, Value& out) const;

    // The record under the key, or null for an absent key or an empty slot.
    PropDataType* Find(const std::string& key) const;

    void Erase(const std::string& key);
    void EraseElements(const std::string& name, int first, int last);
    void Clear() noexcept;

    int Count() const noexcept;
    // The entry at a position, or null when the position is outside the store.
    const std::pair<const std::string, std::unique_ptr<PropDataType>>* At(int position);

private:
    using Map = std::map<std::string, std::unique_ptr<PropDataType>>;

    std::unique_ptr<PropDataType>& SlotFor(const std::string& key);
    static void Release(std::unique_ptr<PropDataType>& slot) noexcept;

    static bool Holds(const PropDataType& record, const char* typeName) {
        return record.m_typeName == typeName;
    }
    static void* ValueOf(const PropDataType& record) { return record.m_value; }
    static void SetValueOf(PropDataType& record, void* value) { record.m_value = value; }

    Map m_entries;
    // Last position handed out by At and the entry there; kept valid across
    // insertions, since entries are never removed.
    Map::iterator m_cursor{};
    int m_cursorPos = -1;
};

}  // namespace vantorbase::detail

#endif  // VANTORBASE_SRC_PROPERTY_PROPERTY_STORE_H
