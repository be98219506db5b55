#include "vantorbase/command_desc.h"

#include <charconv>
#include <memory>
#include <stdexcept>

#include "command/command_desc_contents.h"
#include "foundation/text_values.h"

using vantorbase::detail::CommandDescContents;
using vantorbase::detail::EntryList;
using vantorbase::detail::Narrow;
using vantorbase::detail::Widen;

namespace {

const wchar_t* TypeName(int type) {
    switch (type) {
        case 0: return L"VALUE";
        case 1: return L"STRING";
        case 2: return L"VALUE ARRAY";
        case 3: return L"STRING ARRAY";
        case 4: return L"OBSERVER";
        default: return L"UNKNOWN";
    }
}

template <typename Name>
void Append(EntryList& list, const Name& name, int type, const std::wstring& description) {
    auto entry = std::make_unique<CommandParamDesc>(name, type, description);
    list.byIndex.reserve(list.byIndex.size() + 1);
    list.entries.push_back(entry.get());
    list.byIndex.push_back(entry.release());
}

void Release(EntryList& list) noexcept {
    for (CommandParamDesc*& entry : list.entries) {
        delete entry;
        entry = nullptr;
    }
    list.entries.clear();
    list.byIndex.clear();
}

}  // namespace

namespace vantorbase::detail {

// Entries go list by list, each in order of addition.
CommandDescContents::~CommandDescContents() {
    Release(params);
    Release(results);
    Release(events);
}

}  // namespace vantorbase::detail

// --- CommandParamDesc --------------------------------------------------------

CommandParamDesc::CommandParamDesc(const std::wstring& name, int type,
                                   const std::wstring& description)
    : m_name(name), m_description(description), m_type(type), m_key(Narrow(m_name)) {}

CommandParamDesc::CommandParamDesc(const std::string& name, int type,
                                   const std::wstring& description)
    : m_name(Widen(name)), m_description(description), m_type(type), m_key(Narrow(m_name)) {}

CommandParamDesc::CommandParamDesc(const CommandParamDesc& other) = default;
CommandParamDesc& CommandParamDesc::operator=(const CommandParamDesc& other) = default;
CommandParamDesc::~CommandParamDesc() = default;

std::wstring CommandParamDesc::GetNameW() { return m_name; }
std::string CommandParamDesc::GetName() { return Narrow(m_name); }
std::wstring CommandParamDesc::GetDescW() { return m_description; }
std::string CommandParamDesc::GetDesc() { return Narrow(m_description); }
int CommandParamDesc::GetType() { return m_type; }
std::wstring CommandParamDesc::GetTypeNameW() { return TypeName(m_type); }
std::string CommandParamDesc::GetTypeName() { return Narrow(TypeName(m_type)); }

// --- CommandDesc -------------------------------------------------------------

CommandDesc::CommandDesc() : m_contents(std::make_shared<CommandDescContents>()) {}
CommandDesc::CommandDesc(const CommandDesc& other) = default;
CommandDesc& CommandDesc::operator=(const CommandDesc& other) {
    m_contents = other.m_contents;
    return *this;
}
CommandDesc::~CommandDesc() = default;

void CommandDesc::SetDesc(const std::wstring& name, const std::wstring& description) {
    std::wstring newName = name;
    std::wstring newDescription = description;
    m_contents->name.swap(newName);
    m_contents->description.swap(newDescription);
}

void CommandDesc::SetDesc(const std::string& name, const std::wstring& description) {
    SetDesc(Widen(name), description);
}

std::wstring CommandDesc::GetCommandNameW() { return m_contents->name; }
std::string CommandDesc::GetCommandName() { return Narrow(m_contents->name); }
std::wstring CommandDesc::GetCommandDescW() { return m_contents->description; }
std::string CommandDesc::GetCommandDesc() { return Narrow(m_contents->description); }

std::wstring CommandDesc::GetDescW() {
    const CommandDescContents& c = *m_contents;
    std::wstring text;
    text += c.name;
    text += L" (";
    text += c.description;
    text += L")\n";
    if (c.params.entries.empty() && c.results.entries.empty()) return text;
    text += L"\nParam\tkey\ttype\tdescription";
    text += L'\n';
    text.append(45, L'-');
    const auto rows = [&text](const EntryList& list, const wchar_t* marker) {
        for (CommandParamDesc* entry : list.entries) {
            if (entry == nullptr) continue;
            text += marker;
            text += entry->GetNameW();
            text += L"\t{";
            text += TypeName(entry->GetType());
            text += L"}\t";
            text += entry->GetDescW();
        }
    };
    rows(c.params, L"\n[PARAM]\t");
    rows(c.results, L"\n[RESULT]\t");
    return text;
}

std::string CommandDesc::GetDesc() { return Narrow(GetDescW()); }

CommandParamDesc* CommandDesc::GetAt(std::list<CommandParamDesc*>* list, int index) {
    if (list == nullptr || index < 0) return nullptr;
    for (CommandParamDesc* entry : *list)
        if (index-- == 0) return entry;
    return nullptr;
}

void CommandDesc::ClearParamDescList(std::list<CommandParamDesc*>* list) {
    if (list == nullptr) return;
    for (EntryList* own : {&m_contents->params, &m_contents->results, &m_contents->events})
        if (&own->entries == list) return Release(*own);
}

// The operations of each list, alike but for the list they use.
#define VANTORBASE_COMMAND_DESC_LIST(Kind, member)                                              \
    void CommandDesc::Add##Kind(const std::wstring& name, int type, const std::wstring& desc) { \
        Append(m_contents->member, name, type, desc);                                           \
    }                                                                                           \
    void CommandDesc::Add##Kind(const std::string& name, int type, const std::wstring& desc) {  \
        Append(m_contents->member, name, type, desc);                                           \
    }                                                                                           \
    int CommandDesc::Get##Kind##Count() { return m_contents->member.Count(); }                  \
    CommandParamDesc* CommandDesc::Get##Kind##At(int index) {                                   \
        return m_contents->member.At(index);                                                    \
    }                                                                                           \
    std::wstring CommandDesc::Get##Kind##NameW(int index) {                                     \
        CommandParamDesc* entry = m_contents->member.At(index);                                 \
        return entry ? entry->GetNameW() : std::wstring();                                      \
    }                                                                                           \
    std::string CommandDesc::Get##Kind##Name(int index) {                                       \
        CommandParamDesc* entry = m_contents->member.At(index);                                 \
        return entry ? entry->GetName() : std::string();                                        \
    }                                                                                           \
    std::wstring CommandDesc::Get##Kind##DescW(int index) {                                     \
        CommandParamDesc* entry = m_contents->member.At(index);                                 \
        return entry ? entry->GetDescW() : std::wstring();                                      \
    }                                                                                           \
    std::string CommandDesc::Get##Kind##Desc(int index) {                                       \
        CommandParamDesc* entry = m_contents->member.At(index);                                 \
        return entry ? entry->GetDesc() : std::string();                                        \
    }                                                                                           \
    std::wstring CommandDesc::Get##Kind##TypeNameW(int index) {                                 \
        CommandParamDesc* entry = m_contents->member.At(index);                                 \
        return entry ? entry->GetTypeNameW() : std::wstring(L"UNKNOWN");                        \
    }                                                                                           \
    std::string CommandDesc::Get##Kind##TypeName(int index) {                                   \
        CommandParamDesc* entry = m_contents->member.At(index);                                 \
        return entry ? entry->GetTypeName() : std::string("UNKNOWN");                           \
    }                                                                                           \
    int CommandDesc::Get##Kind##Type(int index) {                                               \
        CommandParamDesc* entry = m_contents->member.At(index);                                 \
        return entry ? entry->GetType() : -1;                                                   \
    }

VANTORBASE_COMMAND_DESC_LIST(Param, params)
VANTORBASE_COMMAND_DESC_LIST(Result, results)
VANTORBASE_COMMAND_DESC_LIST(Event, events)

#undef VANTORBASE_COMMAND_DESC_LIST

// --- CommandDescException ----------------------------------------------------

CommandDescException::CommandDescException(const char* text, int index) {
    if (text == nullptr) throw std::invalid_argument("CommandDescException: null text");
    char digits[16];
    const auto end = std::to_chars(digits, digits + sizeof digits, index).ptr;
    m_message = text;
    m_message += ", idx= ";
    m_message.append(digits, end);
}
CommandDescException::CommandDescException(const CommandDescException& other) = default;
CommandDescException& CommandDescException::operator=(const CommandDescException& other) = default;
CommandDescException::~CommandDescException() = default;

std::string CommandDescException::getMessage() const { return m_message; }
std::wstring CommandDescException::getMessageW() const { return Widen(m_message); }
