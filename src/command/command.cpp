#include "vantorbase/command.h"

#include "command/command_desc_contents.h"
#include "foundation/text_values.h"

using vantorbase::detail::EntryList;
using vantorbase::detail::Narrow;
using vantorbase::detail::Widen;

namespace {

constexpr int kValue = 0;
constexpr int kString = 1;
constexpr int kValueArray = 2;
constexpr int kStringArray = 3;
constexpr int kObserver = 4;

// Whether an accessor that requests one type code may touch an entry of
// another: the int accessors also reach array sizes, the text accessors also
// the plain name of a STRING ARRAY.
bool Accepts(int requested, int entry) {
    if (entry == requested) return true;
    if (requested == kValue) return entry == kValueArray || entry == kStringArray;
    if (requested == kString) return entry == kStringArray;
    return false;
}

}  // namespace

int Command::COMMAND_TYPE = 0;

Command::Command()
    : m_commandType(COMMAND_TYPE), m_run(false), m_shield(false), m_execute(true) {}
Command::Command(const Command& other) = default;
Command& Command::operator=(const Command& other) = default;
Command::~Command() = default;

// --- Flags -------------------------------------------------------------------

bool Command::IsRunning() { return m_run; }
void Command::SetRunFlag(bool run) {
    m_run = run;
    if (!run) Notify();
}
void Command::Cancel() { SetRunFlag(false); }
bool Command::IsShield() { return m_shield; }
void Command::EnableShield(bool shield) { m_shield = shield; }
bool Command::CanExecute() { return m_execute; }
void Command::EnableExecute(bool execute) { m_execute = execute; }
Command* Command::GetInstance() { return nullptr; }
void Command::Run() {}
void Command::Update(Subject*) {}
int Command::GetCommandType() { return m_commandType; }

// --- Declaration -------------------------------------------------------------

int Command::GetParamCount() { return m_desc.GetParamCount(); }
int Command::GetResultCount() { return m_desc.GetResultCount(); }
int Command::GetEventCount() { return m_desc.GetEventCount(); }
CommandDesc* Command::GetCommandDesc() { return &m_desc; }

void Command::AddParam(const std::wstring& name, int type, const std::wstring& description) {
    m_desc.AddParam(name, type, description);
}
void Command::AddParam(const std::string& name, int type, const std::wstring& description) {
    m_desc.AddParam(name, type, description);
}
void Command::AddResult(const std::wstring& name, int type, const std::wstring& description) {
    m_desc.AddResult(name, type, description);
}
void Command::AddResult(const std::string& name, int type, const std::wstring& description) {
    m_desc.AddResult(name, type, description);
}
void Command::AddEvent(const std::wstring& name, int type, const std::wstring& description) {
    m_desc.AddEvent(name, type, description);
}
void Command::AddEvent(const std::string& name, int type, const std::wstring& description) {
    m_desc.AddEvent(name, type, description);
}

void Command::SetDesc(const std::wstring& description) {
    m_desc.SetDesc(GetSubjectName(), description);
}

// --- Validation ----------------------------------------------------------------

const std::string& Command::KeyOf(Family family, int index, int requested) {
    static const char* const texts[] = {"Property::GetParam(key,value) Exception",
                                        "Property::GetResult(key,value) Exception",
                                        "Property::GetEvent(key,value) Exception"};
    auto& contents = *m_desc.m_contents;
    const EntryList& list = family == Family::Param    ? contents.params
                            : family == Family::Result ? contents.results
                                                       : contents.events;
    const CommandParamDesc* entry = list.At(index);
    if (entry == nullptr || !Accepts(requested, entry->m_type))
        throw CommandDescException(texts[static_cast<int>(family)], index);
    return entry->m_key;
}

void Command::CheckValid(Family family, int index, int type) { KeyOf(family, index, type); }
void Command::CheckValidParam(int index, int type) { CheckValid(Family::Param, index, type); }
void Command::CheckValidResult(int index, int type) { CheckValid(Family::Result, index, type); }
void Command::CheckValidEvent(int index, int type) { CheckValid(Family::Event, index, type); }

// --- Texts ---------------------------------------------------------------------
// A parameter's text is read in whichever form it was stored, and missing text
// reads as empty; results and events keep wide text only and a missing one
// raises the store's PropertyException.

namespace {

void ReadTextAt(Property& store, bool parameter, const std::string& key, std::wstring& value) {
    if (!parameter) {
        value = store.GetStringW(key);
        return;
    }
    std::wstring wide;
    if (store.getValue(key, wide)) {
        value = std::move(wide);
        return;
    }
    std::string narrow;
    store.getValue(key, narrow);
    value = Widen(narrow);
}

void ReadTextAt(Property& store, bool parameter, const std::string& key, std::string& value) {
    if (!parameter) {
        value = Narrow(store.GetStringW(key));
        return;
    }
    std::string narrow;
    if (store.getValue(key, narrow)) {
        value = std::move(narrow);
        return;
    }
    std::wstring wide;
    store.getValue(key, wide);
    value = Narrow(wide);
}

}  // namespace

void Command::ReadText(Family family, int index, std::wstring& value) {
    ReadTextAt(*this, family == Family::Param, KeyOf(family, index, kString), value);
}

void Command::ReadText(Family family, int index, std::string& value) {
    ReadTextAt(*this, family == Family::Param, KeyOf(family, index, kString), value);
}

void Command::ReadText(Family family, int index, int element, std::wstring& value) {
    const std::string key = GetArrayKey(KeyOf(family, index, kStringArray).c_str(), element);
    ReadTextAt(*this, family == Family::Param, key, value);
}

void Command::ReadText(Family family, int index, int element, std::string& value) {
    const std::string key = GetArrayKey(KeyOf(family, index, kStringArray).c_str(), element);
    ReadTextAt(*this, family == Family::Param, key, value);
}

void Command::WriteText(Family family, int index, const std::string& value) {
    if (family != Family::Param) {
        const std::wstring wide = Widen(value);
        SetStringW(KeyOf(family, index, kString), wide.c_str());
        return;
    }
    SetString(KeyOf(family, index, kString), value.c_str());
}

void Command::WriteText(Family family, int index, int element, const std::string& value) {
    if (family != Family::Param) {
        const std::wstring wide = Widen(value);
        SetStringW(KeyOf(family, index, kStringArray), element, wide.c_str());
        return;
    }
    SetString(KeyOf(family, index, kStringArray), element, value.c_str());
}

// --- The accessors of each family ------------------------------------------------
// Values are stored up to their first NUL character, as the store's text
// setters take NUL-terminated text.

#define VANTORBASE_COMMAND_FAMILY(Kind)                                                         \
    void Command::Get##Kind(int index, int& value) {                                            \
        value = GetValue(KeyOf(Family::Kind, index, kValue));                                   \
    }                                                                                           \
    void Command::Get##Kind(int index, std::string& value) {                                    \
        ReadText(Family::Kind, index, value);                                                   \
    }                                                                                           \
    void Command::Get##Kind(int index, std::wstring& value) {                                   \
        ReadText(Family::Kind, index, value);                                                   \
    }                                                                                           \
    void Command::Get##Kind(int index, void*& value) {                                          \
        value = GetPointer(KeyOf(Family::Kind, index, kObserver));                              \
    }                                                                                           \
    void Command::Get##Kind(int index, int element, int& value) {                               \
        value = GetValue(KeyOf(Family::Kind, index, kValueArray), element);                     \
    }                                                                                           \
    void Command::Get##Kind(int index, int element, std::string& value) {                       \
        ReadText(Family::Kind, index, element, value);                                          \
    }                                                                                           \
    void Command::Get##Kind(int index, int element, std::wstring& value) {                      \
        ReadText(Family::Kind, index, element, value);                                          \
    }                                                                                           \
    void Command::Set##Kind(int index, int value) {                                             \
        SetValue(KeyOf(Family::Kind, index, kValue), value);                                    \
    }                                                                                           \
    void Command::Set##Kind(int index, const std::string& value) {                              \
        WriteText(Family::Kind, index, value);                                                  \
    }                                                                                           \
    void Command::Set##Kind(int index, const std::wstring& value) {                             \
        SetStringW(KeyOf(Family::Kind, index, kString), value.c_str());                         \
    }                                                                                           \
    void Command::Set##Kind(int index, void* value) {                                           \
        SetPointer(KeyOf(Family::Kind, index, kObserver), value);                               \
    }                                                                                           \
    void Command::Set##Kind(int index, int element, int value) {                                \
        SetValue(KeyOf(Family::Kind, index, kValueArray), element, value);                      \
    }                                                                                           \
    void Command::Set##Kind(int index, int element, const std::string& value) {                 \
        WriteText(Family::Kind, index, element, value);                                         \
    }                                                                                           \
    void Command::Set##Kind(int index, int element, const std::wstring& value) {                \
        SetStringW(KeyOf(Family::Kind, index, kStringArray), element, value.c_str());           \
    }                                                                                           \
    int Command::Get##Kind##ArraySize(int index) {                                              \
        return GetValue(KeyOf(Family::Kind, index, kValue));                                    \
    }                                                                                           \
    void Command::Set##Kind##ArraySize(int index, int size) { Set##Kind(index, size); }

VANTORBASE_COMMAND_FAMILY(Param)
VANTORBASE_COMMAND_FAMILY(Result)
VANTORBASE_COMMAND_FAMILY(Event)

#undef VANTORBASE_COMMAND_FAMILY
