#include "vantorbase/property.h"

#include <algorithm>
#include <charconv>
#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <iterator>
#include <limits>
#include <stdexcept>
#include <type_traits>

#include "property/property_store.h"

#if defined(__GNUC__)
#define VANTORBASE_PREFETCH(address) __builtin_prefetch(address)
#else
#define VANTORBASE_PREFETCH(address) ((void)(address))
#endif

namespace {

constexpr char kIntType[] = "int";
constexpr char kIntPtrType[] = "IntPtr";
constexpr char kStringType[] = "string";
constexpr char kWStringType[] = "wstring";

template <typename Char>
const Char* RequireText(const Char* text, const char* operation) {
    if (text == nullptr) throw std::invalid_argument(std::string(operation) + ": null text argument");
    return text;
}

// The element key of a name and an index, built on the stack for names of
// ordinary length so that indexed reads and writes allocate nothing.
class ElementKey {
public:
    ElementKey(std::string_view name, int index) {
        constexpr size_t kIndexChars = 13;  // "[-2147483648]"
        char* out = m_small;
        if (name.size() + kIndexChars > sizeof m_small) {
            m_large.resize(name.size() + kIndexChars);
            out = &m_large[0];
        }
        std::memcpy(out, name.data(), name.size());
        char* end = out + name.size();
        *end++ = '[';
        end = std::to_chars(end, end + 11, index).ptr;
        *end++ = ']';
        m_view = std::string_view(out, static_cast<size_t>(end - out));
    }
    ElementKey(const ElementKey&) = delete;
    ElementKey& operator=(const ElementKey&) = delete;

    std::string_view view() const noexcept { return m_view; }

private:
    char m_small[64];
    std::string m_large;
    std::string_view m_view;
};

// Parses the "digits]" that follows "name[" in a key; only the canonical
// decimal form that ElementKey writes is accepted.
bool ParseElementIndex(const std::string& key, size_t start, int& index) {
    if (key.size() < start + 2 || key.back() != ']') return false;
    const char* first = key.data() + start;
    const char* last = key.data() + key.size() - 1;
    const char* digits = (*first == '-') ? first + 1 : first;
    if (digits == last) return false;
    if (*digits == '0' && (last - digits != 1 || digits != first)) return false;  // "07", "-0"
    int value = 0;
    const auto result = std::from_chars(first, last, value);
    if (result.ec != std::errc() || result.ptr != last) return false;
    index = value;
    return true;
}

[[noreturn]] void ThrowReadFailure(const char* operation, std::string_view key) {
    throw PropertyException(operation, std::string(key));
}

constexpr char kGetValueText[] = "Property::GetValue(key) Exception";
constexpr char kGetStringText[] = "Property::GetString(key) Exception";
constexpr char kGetPointerText[] = "Property::GetPointer(key) Exception";
constexpr char kGetHandleText[] = "Property::GetHandle(key) Exception";

}  // namespace

// --- Value records -----------------------------------------------------------

PropDataType::PropDataType() : m_typeName("unknown"), m_value(nullptr) {}
PropDataType::~PropDataType() = default;
std::string PropDataType::GetType() { return m_typeName; }

IntPropDataType::IntPropDataType(int value) {
    m_typeName = kIntType;
    m_value = new int(value);
}
IntPropDataType::~IntPropDataType() { IntPropDataType::ReleaseValue(); }
void IntPropDataType::ReleaseValue() {
    delete static_cast<int*>(m_value);
    m_value = nullptr;
}

IntPtrPropDataType::IntPtrPropDataType(int* value) {
    m_typeName = kIntPtrType;
    m_value = value;
}
IntPtrPropDataType::~IntPtrPropDataType() = default;
void IntPtrPropDataType::ReleaseValue() { m_value = nullptr; }

StringPropDataType::StringPropDataType(std::string value) {
    m_typeName = kStringType;
    m_value = new std::string(std::move(value));
}
StringPropDataType::~StringPropDataType() { StringPropDataType::ReleaseValue(); }
void StringPropDataType::ReleaseValue() {
    delete static_cast<std::string*>(m_value);
    m_value = nullptr;
}

WStringPropDataType::WStringPropDataType(std::wstring value) {
    m_typeName = kWStringType;
    m_value = new std::wstring(std::move(value));
}
WStringPropDataType::~WStringPropDataType() { WStringPropDataType::ReleaseValue(); }
void WStringPropDataType::ReleaseValue() {
    delete static_cast<std::wstring*>(m_value);
    m_value = nullptr;
}

// --- The shared store --------------------------------------------------------

namespace vantorbase::detail {

namespace {

// How each record kind is named and keeps its value behind the untyped
// pointer. Texts are written from views, so a write of an existing text key
// copies the characters once.
template <typename Record> struct Kind;
template <> struct Kind<IntPropDataType> {
    static constexpr const char* kTypeName = kIntType;
    static void Assign(void* stored, int value) { *static_cast<int*>(stored) = value; }
    static void Read(const void* stored, int& out) { out = *static_cast<const int*>(stored); }
    static int Construct(int value) { return value; }
};
template <> struct Kind<IntPtrPropDataType> {
    static constexpr const char* kTypeName = kIntPtrType;
    static int* Construct(int* value) { return value; }
};
template <> struct Kind<StringPropDataType> {
    static constexpr const char* kTypeName = kStringType;
    static void Assign(void* stored, std::string_view value) {
        static_cast<std::string*>(stored)->assign(value.data(), value.size());
    }
    static void Read(const void* stored, std::string& out) {
        out = *static_cast<const std::string*>(stored);
    }
    static std::string Construct(std::string_view value) { return std::string(value); }
};
template <> struct Kind<WStringPropDataType> {
    static constexpr const char* kTypeName = kWStringType;
    static void Assign(void* stored, std::wstring_view value) {
        static_cast<std::wstring*>(stored)->assign(value.data(), value.size());
    }
    static void Read(const void* stored, std::wstring& out) {
        out = *static_cast<const std::wstring*>(stored);
    }
    static std::wstring Construct(std::wstring_view value) { return std::wstring(value); }
};

}  // namespace

template <typename Record, typename Value>
void PropertyStore::Write(std::string_view key, const Value& value) {
    Slot& slot = SlotFor(key);
    if (slot && Holds(*slot, Kind<Record>::kTypeName)) {
        if constexpr (std::is_same_v<Record, IntPtrPropDataType>) {
            SetValueOf(*slot, value);
        } else {
            Kind<Record>::Assign(ValueOf(*slot), value);
        }
        return;
    }
    Release(slot);
    slot = std::make_unique<Record>(Kind<Record>::Construct(value));
}

template <typename Record, typename Value>
bool PropertyStore::Read(std::string_view key, Value& out) const {
    const PropDataType* record = Find(key);
    if (record == nullptr || !Holds(*record, Kind<Record>::kTypeName)) return false;
    if constexpr (std::is_same_v<Record, IntPtrPropDataType>) {
        out = static_cast<int*>(ValueOf(*record));
    } else {
        Kind<Record>::Read(ValueOf(*record), out);
    }
    return true;
}

PropDataType* PropertyStore::Find(std::string_view key) const {
    const auto it = m_entries.find(key);
    return it == m_entries.end() ? nullptr : it->second.get();
}

PropertyStore::Slot& PropertyStore::SlotFor(std::string_view key) {
    auto it = m_entries.lower_bound(key);
    if (it == m_entries.end() || it->first != key) {
        it = m_entries.emplace_hint(it, std::string(key), nullptr);
        Inserted(it);
    }
    return it->second;
}

void PropertyStore::Inserted(Map::iterator entry) noexcept {
    // An entry inserted before the cursor moves it one position on.
    if (m_cursorPos >= 0 && entry->first < m_cursor->first) ++m_cursorPos;
    if (!m_indexValid) return;
    if (std::next(entry) != m_entries.end()) {
        m_indexValid = false;
        m_walksSinceInvalidation = 0;
        return;
    }
    try {
        m_index.push_back(entry);
    } catch (...) {
        m_indexValid = false;
        m_walksSinceInvalidation = 0;
    }
}

void PropertyStore::RebuildIndex() noexcept {
    try {
        m_index.clear();
        m_index.reserve(m_entries.size());
        for (auto it = m_entries.begin(); it != m_entries.end(); ++it) m_index.push_back(it);
        m_indexValid = true;
    } catch (...) {
        m_index.clear();
        m_walksSinceInvalidation = 0;
    }
}

void PropertyStore::Release(Slot& slot) noexcept {
    if (!slot) return;
    slot->ReleaseValue();
    slot.reset();
}

void PropertyStore::Erase(std::string_view key) {
    const auto it = m_entries.find(key);
    if (it != m_entries.end()) Release(it->second);
}

void PropertyStore::EraseElements(std::string_view name, int first, int last) {
    if (first > last) return;
    const auto width = static_cast<std::uint64_t>(static_cast<std::int64_t>(last) - first) + 1;
    if (width <= m_entries.size()) {
        // A narrow range: look each element up.
        for (std::int64_t i = first; i <= last; ++i) Erase(ElementKey(name, static_cast<int>(i)).view());
        return;
    }
    // A wide range: visit only the keys that can be elements of the name.
    std::string prefix(name);
    prefix += '[';
    for (auto it = m_entries.lower_bound(prefix);
         it != m_entries.end() && it->first.compare(0, prefix.size(), prefix) == 0; ++it) {
        int index = 0;
        if (ParseElementIndex(it->first, prefix.size(), index) && index >= first && index <= last)
            Release(it->second);
    }
}

void PropertyStore::Clear() noexcept {
    for (auto& entry : m_entries) Release(entry.second);
}

int PropertyStore::Count() const noexcept {
    const auto size = m_entries.size();
    return size > static_cast<size_t>(std::numeric_limits<int>::max())
               ? std::numeric_limits<int>::max()
               : static_cast<int>(size);
}

const PropertyStore::Entry* PropertyStore::At(int position) {
    const int count = Count();
    if (position < 0 || position >= count) return nullptr;
    if (!m_indexValid &&
        ++m_walksSinceInvalidation > std::max<size_t>(64, m_entries.size() / 8))
        RebuildIndex();
    if (!m_indexValid) return WalkTo(position);
    // Enumeration usually goes forward: fetch the entries a few steps ahead,
    // and their records, while this one is handed out.
    const auto ahead = static_cast<size_t>(position) + 8;
    if (ahead < m_index.size()) VANTORBASE_PREFETCH(&*m_index[ahead]);
    if (ahead - 4 < m_index.size()) VANTORBASE_PREFETCH(m_index[ahead - 4]->second.get());
    m_cursor = m_index[static_cast<size_t>(position)];
    m_cursorPos = position;
    return &*m_cursor;
}

const PropertyStore::Entry* PropertyStore::WalkTo(int position) {
    // Walk from whichever of the first entry, the last entry and the cursor
    // is nearest.
    const int count = Count();
    const long long fromCursor =
        m_cursorPos >= 0 ? std::llabs(static_cast<long long>(position) - m_cursorPos) : count;
    const long long fromEnd = static_cast<long long>(count) - 1 - position;
    if (fromCursor <= position && fromCursor <= fromEnd) {
        std::advance(m_cursor, position - m_cursorPos);
    } else if (position <= fromEnd) {
        m_cursor = std::next(m_entries.begin(), position);
    } else {
        m_cursor = std::prev(m_entries.end(), count - position);
    }
    m_cursorPos = position;
    return &*m_cursor;
}

}  // namespace vantorbase::detail

// --- Property ----------------------------------------------------------------

using vantorbase::detail::PropertyStore;

Property::Property() : m_store(std::make_shared<PropertyStore>()) {}
Property::Property(const Property& other) = default;
Property& Property::operator=(const Property& other) {
    m_store = other.m_store;
    return *this;
}
Property::~Property() {
    if (m_store) m_store->Clear();
}

void Property::setValue(const std::string& key, int value) {
    m_store->Write<IntPropDataType>(key, value);
}
void Property::setValue(const std::string& key, int* value) {
    m_store->Write<IntPtrPropDataType>(key, value);
}
void Property::setValue(const std::string& key, const std::string& value) {
    m_store->Write<StringPropDataType>(key, std::string_view(value));
}
void Property::setValue(const std::string& key, const std::wstring& value) {
    m_store->Write<WStringPropDataType>(key, std::wstring_view(value));
}

bool Property::getValue(const std::string& key, int& value) {
    return m_store->Read<IntPropDataType>(key, value);
}
bool Property::getValue(const std::string& key, int*& value) {
    return m_store->Read<IntPtrPropDataType>(key, value);
}
bool Property::getValue(const std::string& key, std::string& value) {
    return m_store->Read<StringPropDataType>(key, value);
}
bool Property::getValue(const std::string& key, std::wstring& value) {
    return m_store->Read<WStringPropDataType>(key, value);
}

std::string Property::GetArrayKey(const char* name, int index) {
    return std::string(ElementKey(RequireText(name, "Property::GetArrayKey"), index).view());
}

// Writers: the four key forms of each family, each writing one record kind
// from the value as the family converts it.
#define VANTORBASE_PROPERTY_WRITER(Family, ValueType, Record, Convert)                          \
    void Property::Family(const char* key, ValueType value) {                                 \
        m_store->Write<Record>(std::string_view(RequireText(key, "Property::" #Family)),       \
                               Convert(value));                                                \
    }                                                                                          \
    void Property::Family(const std::string& key, ValueType value) {                          \
        m_store->Write<Record>(key, Convert(value));                                           \
    }                                                                                          \
    void Property::Family(const char* key, int index, ValueType value) {                      \
        ElementKey element(RequireText(key, "Property::" #Family), index);                     \
        m_store->Write<Record>(element.view(), Convert(value));                                \
    }                                                                                          \
    void Property::Family(const std::string& key, int index, ValueType value) {               \
        ElementKey element(key, index);                                                        \
        m_store->Write<Record>(element.view(), Convert(value));                                \
    }

#define VANTORBASE_AS_INT(value) (value)
#define VANTORBASE_AS_TEXT(value) std::string_view(RequireText(value, "Property::SetString"))
#define VANTORBASE_AS_WTEXT(value) std::wstring_view(RequireText(value, "Property::SetStringW"))
#define VANTORBASE_AS_INTPTR(value) static_cast<int*>(value)

VANTORBASE_PROPERTY_WRITER(SetValue, int, IntPropDataType, VANTORBASE_AS_INT)
VANTORBASE_PROPERTY_WRITER(SetString, const char*, StringPropDataType, VANTORBASE_AS_TEXT)
VANTORBASE_PROPERTY_WRITER(SetStringW, const wchar_t*, WStringPropDataType, VANTORBASE_AS_WTEXT)
VANTORBASE_PROPERTY_WRITER(SetHandle, void*, IntPtrPropDataType, VANTORBASE_AS_INTPTR)
VANTORBASE_PROPERTY_WRITER(SetPointer, void*, IntPtrPropDataType, VANTORBASE_AS_INTPTR)

// Readers: the four key forms of each family; a failed read throws with the
// key that was read (the element key for the indexed forms).
#define VANTORBASE_PROPERTY_READER(Family, Result, Record, Output, Text)                       \
    static Result Family##From(const PropertyStore& store, std::string_view key) {             \
        Output value{};                                                                        \
        if (!store.Read<Record>(key, value)) ThrowReadFailure(Text, key);                      \
        return static_cast<Result>(value);                                                     \
    }                                                                                          \
    Result Property::Family(const std::string& key) { return Family##From(*m_store, key); }    \
    Result Property::Family(const char* key) {                                                 \
        return Family##From(*m_store, RequireText(key, "Property::" #Family));                 \
    }                                                                                          \
    Result Property::Family(const char* key, int index) {                                      \
        ElementKey element(RequireText(key, "Property::" #Family), index);                     \
        return Family##From(*m_store, element.view());                                         \
    }                                                                                          \
    Result Property::Family(const std::string& key, int index) {                               \
        ElementKey element(key, index);                                                        \
        return Family##From(*m_store, element.view());                                         \
    }

VANTORBASE_PROPERTY_READER(GetValue, int, IntPropDataType, int, kGetValueText)
VANTORBASE_PROPERTY_READER(GetString, std::string, StringPropDataType, std::string, kGetStringText)
VANTORBASE_PROPERTY_READER(GetStringW, std::wstring, WStringPropDataType, std::wstring, kGetStringText)
VANTORBASE_PROPERTY_READER(GetPointer, void*, IntPtrPropDataType, int*, kGetPointerText)
VANTORBASE_PROPERTY_READER(GetHandle, void*, IntPtrPropDataType, int*, kGetHandleText)

#undef VANTORBASE_PROPERTY_WRITER
#undef VANTORBASE_AS_INT
#undef VANTORBASE_AS_TEXT
#undef VANTORBASE_AS_WTEXT
#undef VANTORBASE_AS_INTPTR
#undef VANTORBASE_PROPERTY_READER

void Property::Clear() { m_store->Clear(); }
void Property::Erase(const std::string& key) { m_store->Erase(key); }
void Property::Erase(const std::string& name, int index) {
    m_store->Erase(ElementKey(name, index).view());
}
void Property::Erase(const std::string& name, int first, int last) {
    m_store->EraseElements(name, first, last);
}

int Property::getCount() { return m_store->Count(); }

bool Property::getKey(int position, std::string& key) {
    const auto* entry = m_store->At(position);
    if (entry == nullptr) return false;
    key = entry->first;
    return true;
}

bool Property::getType(int position, std::string& type) {
    const auto* entry = m_store->At(position);
    if (entry == nullptr || !entry->second) return false;
    type = entry->second->GetType();
    return true;
}

bool Property::getType(const std::string& key, std::string& type) {
    PropDataType* record = m_store->Find(key);
    if (record == nullptr) return false;
    type = record->GetType();
    return true;
}

bool Property::IsValidType(const std::string& key, const std::string& type) {
    PropDataType* record = m_store->Find(key);
    return record != nullptr && record->GetType() == type;
}
