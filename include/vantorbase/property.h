// VantorBase: the typed key/value store.
//
// A Property maps narrow text keys to typed values: integers, pointer-sized
// values (pointers and handles), narrow text and wide text. Every object of
// the observer hierarchy (observers, subjects, models, views, controllers and
// commands) is a Property.
//
//   Property store;
//   store.SetValue("Volume", 75);
//   store.SetStringW("Items", 3, L"third");      // element key "Items[3]"
//   int volume = store.GetValue("Volume");       // 75
//   store.GetString("Volume");                   // throws PropertyException
//
// Keys are ordered by their bytes, as unsigned values. An entry, once a
// setter has written its key, is never removed: Erase and Clear release the
// value and leave the key with an empty slot, still counted and enumerated.
//
// Copies share: a copy of a Property (and an assignment) refers to the same
// store as its source, so a value written through one is read through the
// other. Destroying any of the sharers releases every value of the store and
// leaves each key with an empty slot; the store itself is reclaimed when its
// last sharer goes.
//
// A Property is used by one thread at a time; copies that share a store share
// that rule.
#ifndef VANTORBASE_PROPERTY_H
#define VANTORBASE_PROPERTY_H

#include <memory>
#include <string>

#include "vantorbase/export.h"

VANTORBASE_SUPPRESS_DLL_INTERFACE_WARNINGS

namespace vantorbase::detail {
class PropertyStore;
}

// The abstract value record that a store keeps under a key. Its type name is
// one of "int", "IntPtr", "string" and "wstring"; "unknown" exists only while
// a record is being constructed.
class VANTORBASE_API PropDataType {
public:
    PropDataType();
    PropDataType(const PropDataType&) = delete;
    PropDataType& operator=(const PropDataType&) = delete;

    // Gives up the value as the concrete kind requires and sets the value
    // pointer to null.
    virtual void ReleaseValue() = 0;

    // Destroys the record. The concrete records release a value that is
    // still held, so a record made and destroyed by a caller leaks nothing.
    virtual ~PropDataType();

    // A copy of the type name.
    std::string GetType();

protected:
    std::string m_typeName;
    void* m_value;

    friend class vantorbase::detail::PropertyStore;
};

// An int, kept in storage of the record's own.
class VANTORBASE_API IntPropDataType : public PropDataType {
public:
    explicit IntPropDataType(int value);
    ~IntPropDataType() override;
    void ReleaseValue() override;
};

// A pointer-sized value (a pointer or a handle), kept as it is. The record
// never owns, reads or frees what the pointer refers to.
class VANTORBASE_API IntPtrPropDataType : public PropDataType {
public:
    explicit IntPtrPropDataType(int* value);
    ~IntPtrPropDataType() override;
    void ReleaseValue() override;
};

// A copy of a narrow text.
class VANTORBASE_API StringPropDataType : public PropDataType {
public:
    explicit StringPropDataType(std::string value);
    ~StringPropDataType() override;
    void ReleaseValue() override;
};

// A copy of a wide text.
class VANTORBASE_API WStringPropDataType : public PropDataType {
public:
    explicit WStringPropDataType(std::wstring value);
    ~WStringPropDataType() override;
    void ReleaseValue() override;
};

// Raised by the throwing getters of Property when a key holds no value of
// the requested type. Each object owns its complete message, which stays
// readable for as long as that object lives; copies carry copies of it.
//
// While the library is initialised (see VANTOR_Init), constructing one also
// writes "\n=====================\n", the message and the banner again to the
// debugger output.
//
// PropertyException derives from no other class: catch it by its own type.
class VANTORBASE_API PropertyException {
public:
    // The message is `operation`, then ", Key= " and `key`.
    // Throws std::invalid_argument if `operation` is null.
    PropertyException(const char* operation, const std::string& key);

    // As above, followed by ", idx= " and `index` in decimal.
    PropertyException(const char* operation, const std::string& key, int index);

    PropertyException(const PropertyException& other);
    PropertyException& operator=(const PropertyException& other);
    ~PropertyException();

    // The message, as narrow text.
    std::string getMessage() const;
    // The message converted to wide text from the ANSI code page.
    std::wstring getMessageW() const;

private:
    void Announce() const;

    std::string m_message;
};

// The typed key/value store; see the top of this header.
//
// Text arguments given as `const char*` or `const wchar_t*` are copied; a
// null one raises std::invalid_argument and changes nothing. Keys contain no
// NUL character.
class VANTORBASE_API Property {
public:
    // Creates an empty store.
    Property();
    // Shares the store of `other`.
    Property(const Property& other);
    // From now on this object refers to the store of `other`. The store it
    // referred to before is left as it is for its other sharers.
    Property& operator=(const Property& other);
    // Releases every value of the store, as Clear does; the keys stay.
    ~Property();

    // --- Lower layer: one typed record, success reported as bool. ---------

    // Replace the key's value, whatever its previous type, creating the
    // entry if needed.
    void setValue(const std::string& key, int value);
    void setValue(const std::string& key, int* value);
    void setValue(const std::string& key, const std::string& value);
    void setValue(const std::string& key, const std::wstring& value);

    // Read the key's value if it holds one of the output's type ("int",
    // "IntPtr", "string", "wstring"); otherwise return false and leave the
    // output untouched. Reads never convert between types.
    bool getValue(const std::string& key, int& value);
    bool getValue(const std::string& key, int*& value);
    bool getValue(const std::string& key, std::string& value);
    bool getValue(const std::string& key, std::wstring& value);

    // --- Element keys. -----------------------------------------------------

    // The key of element `index` of the array `name`: the name, "[", the
    // index in signed decimal and "]" (element 3 of Items is "Items[3]").
    static std::string GetArrayKey(const char* name, int index);

    // --- Upper layer: writers. ---------------------------------------------
    // Each comes in four key forms; the indexed ones write the element key.

    void SetValue(const char* key, int value);
    void SetValue(const std::string& key, int value);
    void SetValue(const char* key, int index, int value);
    void SetValue(const std::string& key, int index, int value);

    // Stores a "string" record holding a copy of the text.
    void SetString(const char* key, const char* value);
    void SetString(const std::string& key, const char* value);
    void SetString(const char* key, int index, const char* value);
    void SetString(const std::string& key, int index, const char* value);

    // Stores a "wstring" record holding a copy of the text.
    void SetStringW(const char* key, const wchar_t* value);
    void SetStringW(const std::string& key, const wchar_t* value);
    void SetStringW(const char* key, int index, const wchar_t* value);
    void SetStringW(const std::string& key, int index, const wchar_t* value);

    // Store the pointer or handle itself in an "IntPtr" record. SetHandle and
    // SetPointer are one operation under two names; GetHandle and GetPointer
    // both read what either wrote.
    void SetHandle(const char* key, void* value);
    void SetHandle(const std::string& key, void* value);
    void SetHandle(const char* key, int index, void* value);
    void SetHandle(const std::string& key, int index, void* value);

    void SetPointer(const char* key, void* value);
    void SetPointer(const std::string& key, void* value);
    void SetPointer(const char* key, int index, void* value);
    void SetPointer(const std::string& key, int index, void* value);

    // --- Upper layer: readers. ---------------------------------------------
    // Each returns the stored value or throws PropertyException whose message
    // names the operation and the key read (the element key for the indexed
    // forms). No reader returns a default value.

    // Operation text "Property::GetValue(key) Exception".
    int GetValue(const char* key);
    int GetValue(const std::string& key);
    int GetValue(const char* key, int index);
    int GetValue(const std::string& key, int index);

    // Operation text "Property::GetString(key) Exception".
    std::string GetString(const char* key);
    std::string GetString(const std::string& key);
    std::string GetString(const char* key, int index);
    std::string GetString(const std::string& key, int index);

    // Operation text "Property::GetString(key) Exception" as well.
    std::wstring GetStringW(const char* key);
    std::wstring GetStringW(const std::string& key);
    std::wstring GetStringW(const char* key, int index);
    std::wstring GetStringW(const std::string& key, int index);

    // Operation text "Property::GetPointer(key) Exception".
    void* GetPointer(const char* key);
    void* GetPointer(const std::string& key);
    void* GetPointer(const char* key, int index);
    void* GetPointer(const std::string& key, int index);

    // Operation text "Property::GetHandle(key) Exception".
    void* GetHandle(const char* key);
    void* GetHandle(const std::string& key);
    void* GetHandle(const char* key, int index);
    void* GetHandle(const std::string& key, int index);

    // --- Removal. ------------------------------------------------------------

    // Releases every value; every key stays, with an empty slot.
    void Clear();
    // Releases the value under the key. A key never written is not created.
    void Erase(const std::string& key);
    // Erases the element key of `name` and `index`.
    void Erase(const std::string& name, int index);
    // Erases the elements `first` to `last` of `name`, both included; nothing
    // if first > last. Only element keys in canonical form ("Items[7]", never
    // "Items[07]") are elements. Costs in proportion to the smaller of the
    // range's width and the number of keys that start with "name[".
    void Erase(const std::string& name, int first, int last);

    // --- Enumeration, in key order, empty slots included. -------------------

    // The number of entries.
    int getCount();
    // The key at a position from 0; false (output untouched) when the
    // position is negative or past the last entry. Stepping through the
    // positions in order costs amortised constant time per step.
    bool getKey(int position, std::string& key);
    // The type name of the value at a position; false for an empty slot or a
    // position outside the store.
    bool getType(int position, std::string& type);
    // The type name of the value under a key; false for an absent key or an
    // empty slot.
    bool getType(const std::string& key, std::string& type);

private:
    bool IsValidType(const std::string& key, const std::string& type);

    std::shared_ptr<vantorbase::detail::PropertyStore> m_store;
};

VANTORBASE_RESTORE_WARNINGS

#endif  // VANTORBASE_PROPERTY_H
