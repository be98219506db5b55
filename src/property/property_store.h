// The store that Property objects share: an ordered map from key to slot,
// with an index that makes positional enumeration cheap.
#ifndef VANTORBASE_SRC_PROPERTY_PROPERTY_STORE_H
#define VANTORBASE_SRC_PROPERTY_PROPERTY_STORE_H

#include <map>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include "vantorbase/property.h"

namespace vantorbase::detail {

class PropertyStore {
public:
    using Slot = std::unique_ptr<PropDataType>;
    using Entry = std::pair<const std::string, Slot>;

    PropertyStore() = default;
    PropertyStore(const PropertyStore&) = delete;
    PropertyStore& operator=(const PropertyStore&) = delete;
    ~PropertyStore() { Clear(); }

    // Replaces the key's value with a record of Record's kind, creating the
    // entry if needed. A record of the same kind is updated in place, which
    // is indistinguishable from releasing it and building a new one.
    template <typename Record, typename Value>
    void Write(std::string_view key, const Value& value);

    // Copies the value under the key into `out` if the key holds a record of
    // Record's kind; otherwise returns false and leaves `out` alone.
    template <typename Record, typename Value>
    bool Read(std::string_view key, Value& out) const;

    // The record under the key, or null for an absent key or an empty slot.
    PropDataType* Find(std::string_view key) const;

    void Erase(std::string_view key);
    void EraseElements(std::string_view name, int first, int last);
    void Clear() noexcept;

    int Count() const noexcept;
    // The entry at a position in key order, or null outside the store.
    const Entry* At(int position);

private:
    using Map = std::map<std::string, Slot, std::less<>>;

    Slot& SlotFor(std::string_view key);
    void Inserted(Map::iterator entry) noexcept;
    void RebuildIndex() noexcept;
    const Entry* WalkTo(int position);
    static void Release(Slot& slot) noexcept;
    static bool Holds(const PropDataType& record, const char* typeName) {
        return record.m_typeName == typeName;
    }
    static void* ValueOf(const PropDataType& record) { return record.m_value; }
    static void SetValueOf(PropDataType& record, void* value) { record.m_value = value; }

    Map m_entries;

    // Positional access. While m_indexValid, m_index lists every entry in key
    // order. An insertion other than at the end invalidates it; positions are
    // then found by walking from a cursor, and the index is rebuilt once
    // enough positional reads have come to pay for it.
    std::vector<Map::iterator> m_index;
    bool m_indexValid = true;
    size_t m_walksSinceInvalidation = 0;
    Map::iterator m_cursor{};
    int m_cursorPos = -1;
};

}  // namespace vantorbase::detail

#endif  // VANTORBASE_SRC_PROPERTY_PROPERTY_STORE_H
