// VantorBase: command descriptors.
//
// A CommandDesc declares what a command takes and gives back: a command
// name, a one-line description, and three ordered lists of entries (its
// parameters, its results and its events). Each entry, a CommandParamDesc,
// names one value and gives its type code and a description. The name of an
// entry, as narrow text, is the key under which a Command keeps the value in
// its property store.
//
// Type codes are plain ints: 0 "VALUE" (an int), 1 "STRING" (a text),
// 2 "VALUE ARRAY" (a size and int elements), 3 "STRING ARRAY" (a size and
// text elements), 4 "OBSERVER" (a pointer); any other code is named
// "UNKNOWN". Codes are stored as given, never validated.
//
// Copies of a descriptor share its name, description, lists and entries: a
// change through one is seen through all, and entry pointers handed out stay
// valid while any copy lives.
#ifndef VANTORBASE_COMMAND_DESC_H
#define VANTORBASE_COMMAND_DESC_H

#include <list>
#include <memory>
#include <string>

#include "vantorbase/export.h"

VANTORBASE_SUPPRESS_DLL_INTERFACE_WARNINGS

class Command;
namespace vantorbase::detail {
struct CommandDescContents;
}

// One entry of a descriptor: a name, a type code and a description. An entry
// does not change after construction, short of assignment.
class VANTORBASE_API CommandParamDesc {
public:
    CommandParamDesc(const std::wstring& name, int type, const std::wstring& description);
    // The name is converted from the ANSI code page with string2wstring.
    CommandParamDesc(const std::string& name, int type, const std::wstring& description);
    CommandParamDesc(const CommandParamDesc& other);
    CommandParamDesc& operator=(const CommandParamDesc& other);
    ~CommandParamDesc();

    std::wstring GetNameW();
    // The name through wstring2string.
    std::string GetName();
    std::wstring GetDescW();
    std::string GetDesc();
    int GetType();
    // "VALUE", "STRING", "VALUE ARRAY", "STRING ARRAY", "OBSERVER" or
    // "UNKNOWN".
    std::wstring GetTypeNameW();
    std::string GetTypeName();

private:
    std::wstring m_name;
    std::wstring m_description;
    int m_type;
    // The narrow name, computed once: the entry's key in a command's store.
    std::string m_key;

    friend class Command;
};

// A command's declaration; see the top of this header.
//
// The getters by index answer for an index from 0 to count - 1; outside it
// they return an empty text, "UNKNOWN" for a type name, -1 for a type code
// and null for an entry.
class VANTORBASE_API CommandDesc {
public:
    // Command name "unknown", empty description, three empty lists.
    CommandDesc();
    // Shares the source's contents.
    CommandDesc(const CommandDesc& other);
    // From now on shares the source's contents; the contents held before are
    // released if no other descriptor holds them.
    CommandDesc& operator=(const CommandDesc& other);
    ~CommandDesc();

    // Replace the command name and description. The narrow name is
    // converted with string2wstring.
    void SetDesc(const std::wstring& name, const std::wstring& description);
    void SetDesc(const std::string& name, const std::wstring& description);

    std::wstring GetCommandNameW();
    std::string GetCommandName();
    std::wstring GetCommandDescW();
    std::string GetCommandDesc();

    // The whole descriptor as readable text: the title line
    // "name (description)\n"; then, if there is any parameter or result, the
    // header "\nParam\tkey\ttype\tdescription", a rule of 45 '-' on its own
    // line, and one row per parameter ("\n[PARAM]\tname\t{TYPE}\tdescription")
    // followed by one per result ("[RESULT]" in place of "[PARAM]"). Events
    // are not rendered.
    std::wstring GetDescW();
    // GetDescW converted once with wstring2string.
    std::string GetDesc();

    // The entry at an index of the given list, found by walking it from the
    // first entry; null where there is none. The entry stays owned by its
    // descriptor.
    CommandParamDesc* GetAt(std::list<CommandParamDesc*>* list, int index);

    // Append an entry; nothing is validated.
    void AddParam(const std::wstring& name, int type, const std::wstring& description);
    void AddParam(const std::string& name, int type, const std::wstring& description);
    void AddResult(const std::wstring& name, int type, const std::wstring& description);
    void AddResult(const std::string& name, int type, const std::wstring& description);
    void AddEvent(const std::wstring& name, int type, const std::wstring& description);
    void AddEvent(const std::string& name, int type, const std::wstring& description);

    int GetParamCount();
    int GetResultCount();
    int GetEventCount();

    std::wstring GetParamNameW(int index);
    std::string GetParamName(int index);
    std::wstring GetResultNameW(int index);
    std::string GetResultName(int index);
    std::wstring GetEventNameW(int index);
    std::string GetEventName(int index);

    std::wstring GetParamDescW(int index);
    std::string GetParamDesc(int index);
    std::wstring GetResultDescW(int index);
    std::string GetResultDesc(int index);
    std::wstring GetEventDescW(int index);
    std::string GetEventDesc(int index);

    std::wstring GetParamTypeNameW(int index);
    std::string GetParamTypeName(int index);
    std::wstring GetResultTypeNameW(int index);
    std::string GetResultTypeName(int index);
    std::wstring GetEventTypeNameW(int index);
    std::string GetEventTypeName(int index);

    int GetParamType(int index);
    int GetResultType(int index);
    int GetEventType(int index);

    // The entry at an index, or null; valid while any sharer of this
    // descriptor lives.
    CommandParamDesc* GetParamAt(int index);
    CommandParamDesc* GetResultAt(int index);
    CommandParamDesc* GetEventAt(int index);

private:
    // Releases every entry of the list and leaves it empty; a null list does
    // nothing.
    void ClearParamDescList(std::list<CommandParamDesc*>* list);

    std::shared_ptr<vantorbase::detail::CommandDescContents> m_contents;

    friend class Command;
};

// Raised when a command's value is accessed in a way its descriptor does not
// allow. The message is the text given, ", idx= " and the index; every copy
// carries the complete message. Derives from no other class.
class VANTORBASE_API CommandDescException {
public:
    // Throws std::invalid_argument if `text` is null.
    CommandDescException(const char* text, int index);
    CommandDescException(const CommandDescException& other);
    CommandDescException& operator=(const CommandDescException& other);
    ~CommandDescException();

    std::string getMessage() const;
    // The message converted with string2wstring.
    std::wstring getMessageW() const;

private:
    std::string m_message;
};

VANTORBASE_RESTORE_WARNINGS

#endif  // VANTORBASE_COMMAND_DESC_H
