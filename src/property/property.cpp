#include "vantorbase/property.h"

#include <charconv>
#include <cstdlib>
#include <cstdint>
#include <iterator>
#include <limits>
#include <stdexcept>
#include <type_traits>

#include "property/property_store.h"

// --- Value records -----------------------------------------------------------

namespace {
constexpr char kIntType[] = "int";
constexpr char kIntPtrType[] = "IntPtr";
constexpr char kStringType[] = "string";
constexpr char kWStringType[] = "wstring";

// The type name of each record kind.
template <typename Record> struct RecordTraits;
template <> struct RecordTraits<IntPropDataType> {
    static constexpr const char* kTypeName = kIntType;
};
template <> struct RecordTraits<IntPtrPropDataType> {
    static constexpr const char* kTypeName = kIntPtrType;
};
template <> struct RecordTraits<StringPropDataType> {
    static constexpr const char* kTypeName = kStringType;
};
template <> struct RecordTraits<WStringPropDataType> {
    static constexpr const char* kTypeName = kWStringType;
};

const char* RequireText(const char* text, const char* operation) {
    if (text == nullptr) throw std::invalid_argument(std::string(operation) + ": null text argument");
    return text;
}

template <typename Char>
const Char* RequireValue(const Char* text, const char* operation) {
    if (text == nullptr) throw std::invalid_argument(std::string(operation) + ": null text argument");
    return text;
}

// Appends "[index]" to `key`.
void AppendIndex(std::string& key, int index) {
    char digits[16];
    const auto end = std::to_chars(digits, digits + sizeof digits, index).ptr;
    key += '[';
    key.append(digits, end);
    key += ']';
}

std::string ElementKey(const std::string& name, int index) {
    std::string key;
    key.reserve(name.size() + 13);
    key.append(name);
    AppendIndex(key, index);
    return key;
}

// Parses the "digits]" that follows "name[" in an element key; only the
// canonical decimal form that ElementKey writes is accepted.
bool ParseElementIndex(const std::string& key, size_t start, int& index) {
    if (key.size() < start + 2 || key.back() != ']') return false;
    const char* first = key.data() + start;
    const char* last = key.data() + key.size() - 1;
    const char* digits = (*first == '-') ? first + 1 : first;
    if (digits == last || (*digits == '0' && (last - digits != 1 || digits != first))) return false;
    int value = 0;
    const auto result = std::from_chars(first, last, value);
    if (result.ec != std::errc() || result.ptr != last) return false;
    index = value;
    return true;
}

[[noreturn]] void ThrowReadFailure(const char* operation, const std::string& key) {
    throw PropertyException(operation, key);
}

constexpr char kGetValueText[] = "Property::GetValue(key) Exception";
constexpr char kGetStringText[] = "Property::GetString(key) Exception";
constexpr char kGetPointerText[] = "Property::GetPointer(key) Exception";
constexpr char kGetHandleText[] = "Property::GetHandle(key) Exception";
}  // namespace

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
// How a record kind keeps its value behind the untyped pointer.
template <typename Record> struct Storage;
template <> struct Storage<IntPropDataType> {
    static void Assign(void* slot, int value) { *static_cast<int*>(slot) = value; }
    static void Read(const void* slot, int& out) { out = *static_cast<const int*>(slot); }
};
template <> struct Storage<StringPropDataType> {
    static void Assign(void* slot, const std::string& v) { *static_cast<std::string*>(slot) = v; }
    static void Read(const void* slot, std::string& out) { out = *static_cast<const std::string*>(slot); }
};
template <> struct Storage<WStringPropDataType> {
    static void Assign(void* slot, const std::wstring& v) { *static_cast<std::wstring*>(slot) = v; }
    static void Read(const void* slot, std::wstring& out) {
        out = *static_cast<const std::wstring*>(slot);
    }
};
}  // namespace

template <typename Record, typename Value>
void PropertyStore::Write(const std::string& key, const Value& value) {
    std::unique_ptr<PropDataType>& slot = SlotFor(key);
    if (slot && Holds(*slot, RecordTraits<Record>::kTypeName)) {
        if constexpr (std::is_same_v<Record, IntPtrPropDataType>) {
            SetValueOf(*slot, value);
        } else {
            Storage<Record>::Assign(ValueOf(*slot), value);
        }
        return;
    }
    Release(slot);
    slot = std::make_unique<Record>(value);
}

template <typename Record, typename Value>
bool PropertyStore::Read(const std::string& key, Value& out) const {
    const PropDataType* record = Find(key);
    if (record == nullptr || !Holds(*record, RecordTraits<Record>::kTypeName)) return false;
    if constexpr (std::is_same_v<Record, IntPtrPropDataType>) {
        out = static_cast<int*>(ValueOf(*record));
    } else {
        Storage<Record>::Read(ValueOf(*record), out);
    }
    return true;
}

PropDataType* PropertyStore::Find(const std::string& key) const {
    const auto it = m_entries.find(key);
    return it == m_entries.end() ? nullptr : it->second.get();
}

std::unique_ptr<PropDataType>& PropertyStore::SlotFor(const std::string& key) {
    auto it = m_entries.lower_bound(key);
    if (it == m_entries.end() || it->first != key) {
        it = m_entries.emplace_hint(it, key, nullptr);
        // An entry inserted before the cursor moves it one position on.
        if (m_cursorPos >= 0 && it->first < m_cursor->first) ++m_cursorPos;
    }
    return it->second;
}

void PropertyStore::Release(std::unique_ptr<PropDataType>& slot) noexcept {
    if (!slot) return;
    slot->ReleaseValue();
    slot.reset();
}

void PropertyStore::Erase(const std::string& key) {
    const auto it = m_entries.find(key);
    if (it != m_entries.end()) Release(it->second);
}

void PropertyStore::EraseElements(const std::string& name, int first, int last) {
    if (first > last) return;
    const auto width = static_cast<std::uint64_t>(static_cast<std::int64_t>(last) - first) + 1;
    if (width <= m_entries.size()) {
        // A narrow range: look each element up.
        for (std::int64_t i = first; i <= last; ++i) Erase(ElementKey(name, static_cast<int>(i)));
        return;
    }
    // A wide range: visit only the keys that can be elements of the name.
    std::string prefix = name;
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

const std::pair<const std::string, std::unique_ptr<PropDataType>>* PropertyStore::At(int position) {
    const int count = Count();
    if (position < 0 || position >= count) return nullptr;
    // Walk from whichever of the first entry, the last entry and the cursor
    // is nearest.
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
    m_store->Write<StringPropDataType>(key, value);
}
void Property::setValue(const std::string& key, const std::wstring& value) {
    m_store->Write<WStringPropDataType>(key, value);
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
    RequireText(name, "Property::GetArrayKey");
    std::string key;
    key.reserve(std::char_traits<char>::length(name) + 13);
    key.append(name);
    AppendIndex(key, index);
    return key;
}

// Writers: the four key forms of each family.
#define VANTORBASE_PROPERTY_WRITER(Family, ValueType, Store)                                   \
    void Property::Family(const char* key, ValueType value) {                                 \
        Store(std::string(RequireText(key, "Property::" #Family)), value, "Property::" #Family); \
    }                                                                                          \
    void Property::Family(const std::string& key, ValueType value) {                          \
        Store(key, value, "Property::" #Family);                                               \
    }                                                                                          \
    void Property::Family(const char* key, int index, ValueType value) {                      \
        Store(GetArrayKey(RequireText(key, "Property::" #Family), index), value,               \
              "Property::" #Family);                                                           \
    }                                                                                          \
    void Property::Family(const std::string& key, int index, ValueType value) {               \
        Store(ElementKey(key, index), value, "Property::" #Family);                            \
    }

#define VANTORBASE_STORE_INT(key, value, op) setValue(key, value)
#define VANTORBASE_STORE_TEXT(key, value, op) setValue(key, std::string(RequireValue(value, op)))
#define VANTORBASE_STORE_WTEXT(key, value, op) setValue(key, std::wstring(RequireValue(value, op)))
#define VANTORBASE_STORE_POINTER(key, value, op) setValue(key, static_cast<int*>(value))

VANTORBASE_PROPERTY_WRITER(SetValue, int, VANTORBASE_STORE_INT)
VANTORBASE_PROPERTY_WRITER(SetString, const char*, VANTORBASE_STORE_TEXT)
VANTORBASE_PROPERTY_WRITER(SetStringW, const wchar_t*, VANTORBASE_STORE_WTEXT)
VANTORBASE_PROPERTY_WRITER(SetHandle, void*, VANTORBASE_STORE_POINTER)
VANTORBASE_PROPERTY_WRITER(SetPointer, void*, VANTORBASE_STORE_POINTER)

// Readers: the four key forms of each family; a failed read throws with the
// key that was read.
#define VANTORBASE_PROPERTY_READER(Family, Result, Output, Text, Convert)                      \
    Result Property::Family(const std::string& key) {                                          \
        Output value{};                                                                        \
        if (!getValue(key, value)) ThrowReadFailure(Text, key);                                \
        return Convert(value);                                                                 \
    }                                                                                          \
    Result Property::Family(const char* key) {                                                 \
        return Family(std::string(RequireText(key, "Property::" #Family)));                    \
    }                                                                                          \
    Result Property::Family(const char* key, int index) {                                      \
        return Family(GetArrayKey(RequireText(key, "Property::" #Family), index));             \
    }                                                                                          \
    Result Property::Family(const std::string& key, int index) {                               \
        return Family(ElementKey(key, index));                                                 \
    }

#define VANTORBASE_AS_IS(value) value
#define VANTORBASE_AS_VOID(value) static_cast<void*>(value)

VANTORBASE_PROPERTY_READER(GetValue, int, int, kGetValueText, VANTORBASE_AS_IS)
VANTORBASE_PROPERTY_READER(GetString, std::string, std::string, kGetStringText, VANTORBASE_AS_IS)
VANTORBASE_PROPERTY_READER(GetStringW, std::wstring, std::wstring, kGetStringText, VANTORBASE_AS_IS)
VANTORBASE_PROPERTY_READER(GetPointer, void*, int*, kGetPointerText, VANTORBASE_AS_VOID)
VANTORBASE_PROPERTY_READER(GetHandle, void*, int*, kGetHandleText, VANTORBASE_AS_VOID)

#undef VANTORBASE_PROPERTY_WRITER
#undef VANTORBASE_STORE_INT
#undef VANTORBASE_STORE_TEXT
#undef VANTORBASE_STORE_WTEXT
#undef VANTORBASE_STORE_POINTER
#undef VANTORBASE_PROPERTY_READER
#undef VANTORBASE_AS_IS
#undef VANTORBASE_AS_VOID

void Property::Clear() { m_store->Clear(); }
void Property::Erase(const std::string& key) { m_store->Erase(key); }
void Property::Erase(const std::string& name, int index) { m_store->Erase(ElementKey(name, index)); }
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
