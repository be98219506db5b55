// VantorBase: commands.
//
// Command is the base class of every command an application defines. A
// command is a Subject (observers can be attached, and it carries a property
// store), owns a descriptor that declares its parameters, results and events,
// and carries a run flag, a shield flag, an execute flag and a command type.
//
//   class VolumeCommand : public Command {
//   public:
//       VolumeCommand() {
//           SetDesc(L"Sets the level");          // names it "VolumeCommand"
//           AddParam(L"level", 0, L"new level");
//           AddResult(L"state", 1, L"outcome");
//       }
//       void Run() override {
//           int level = 0;
//           GetParam(0, level);
//           SetResult(0, std::wstring(L"set"));
//       }
//   };
//
// Values are addressed by the index of their entry in its list. Every access
// is checked against the entry's type code first, and raises
// CommandDescException (no value is read or written) when the index is out of
// range or the code does not fit:
//
//   accessor                         accepted entry codes
//   int, by index                    0 VALUE, 2 VALUE ARRAY, 3 STRING ARRAY
//   text, by index                   1 STRING, 3 STRING ARRAY
//   pointer, by index                4 OBSERVER
//   int, by index and element        2 VALUE ARRAY
//   text, by index and element       3 STRING ARRAY
//
// The value is kept in the store under the entry's narrow name (element j
// under the element key "name[j]"); parameters, results and events share one
// key space. A getter whose value is missing raises the store's
// PropertyException, except the parameter text getters, which yield empty
// text. Parameter texts keep the form they were set in and are read in either
// form; result and event texts are kept wide only. Element indexes are not
// bounded by the stored size. No accessor notifies observers.
//
// Copies share the store, the observer list and the descriptor contents.
#ifndef VANTORBASE_COMMAND_H
#define VANTORBASE_COMMAND_H

#include <string>

#include "vantorbase/command_desc.h"
#include "vantorbase/export.h"
#include "vantorbase/observer.h"

VANTORBASE_SUPPRESS_DLL_INTERFACE_WARNINGS

class VANTORBASE_API Command : public Subject {
public:
    // Copied into the command type of every command constructed afterwards.
    // 0 unless the application changes it; the library never does.
    static int COMMAND_TYPE;

    // Not running, not shielded, executable, command type COMMAND_TYPE, and
    // the descriptor named "unknown" with no entries.
    Command();
    Command(const Command& other);
    Command& operator=(const Command& other);
    // Notifies nobody.
    ~Command() override;

    // --- Flags -------------------------------------------------------------

    bool IsRunning();
    // Stores the flag; false notifies every observer (also when the command
    // was not running), true notifies nobody.
    virtual void SetRunFlag(bool run);
    // SetRunFlag(false), through the virtual table.
    virtual void Cancel();
    virtual bool IsShield();
    void EnableShield(bool shield);
    virtual bool CanExecute();
    void EnableExecute(bool execute);
    // Null unless a derived command says otherwise.
    virtual Command* GetInstance();
    // The command's work; the base version does nothing.
    virtual void Run();
    // Ignores the call.
    void Update(Subject* subject) override;
    // The command type copied from COMMAND_TYPE at construction.
    int GetCommandType();

    // --- Declaration -------------------------------------------------------

    int GetParamCount();
    int GetResultCount();
    int GetEventCount();
    // The command's own descriptor: never null, the same on every call.
    CommandDesc* GetCommandDesc();
    void AddParam(const std::wstring& name, int type, const std::wstring& description);
    void AddParam(const std::string& name, int type, const std::wstring& description);
    void AddResult(const std::wstring& name, int type, const std::wstring& description);
    void AddResult(const std::string& name, int type, const std::wstring& description);
    void AddEvent(const std::wstring& name, int type, const std::wstring& description);
    void AddEvent(const std::string& name, int type, const std::wstring& description);
    // Names the descriptor after the object's most-derived class (see
    // Subject::GetSubjectName) and sets its description.
    void SetDesc(const std::wstring& description);

    // --- Parameters ----------------------------------------------------------
    // Validation failures carry "Property::GetParam(key,value) Exception".

    void GetParam(int index, int& value);
    void GetParam(int index, std::string& value);
    void GetParam(int index, std::wstring& value);
    void GetParam(int index, void*& value);
    void GetParam(int index, int element, int& value);
    void GetParam(int index, int element, std::string& value);
    void GetParam(int index, int element, std::wstring& value);
    void SetParam(int index, int value);
    void SetParam(int index, const std::string& value);
    void SetParam(int index, const std::wstring& value);
    void SetParam(int index, void* value);
    void SetParam(int index, int element, int value);
    void SetParam(int index, int element, const std::string& value);
    void SetParam(int index, int element, const std::wstring& value);
    int GetParamArraySize(int index);
    void SetParamArraySize(int index, int size);

    // --- Results -------------------------------------------------------------
    // Validation failures carry "Property::GetResult(key,value) Exception".

    void GetResult(int index, int& value);
    void GetResult(int index, std::string& value);
    void GetResult(int index, std::wstring& value);
    void GetResult(int index, void*& value);
    void GetResult(int index, int element, int& value);
    void GetResult(int index, int element, std::string& value);
    void GetResult(int index, int element, std::wstring& value);
    void SetResult(int index, int value);
    void SetResult(int index, const std::string& value);
    void SetResult(int index, const std::wstring& value);
    void SetResult(int index, void* value);
    void SetResult(int index, int element, int value);
    void SetResult(int index, int element, const std::string& value);
    void SetResult(int index, int element, const std::wstring& value);
    int GetResultArraySize(int index);
    void SetResultArraySize(int index, int size);

    // --- Events --------------------------------------------------------------
    // Validation failures carry "Property::GetEvent(key,value) Exception".

    void GetEvent(int index, int& value);
    void GetEvent(int index, std::string& value);
    void GetEvent(int index, std::wstring& value);
    void GetEvent(int index, void*& value);
    void GetEvent(int index, int element, int& value);
    void GetEvent(int index, int element, std::string& value);
    void GetEvent(int index, int element, std::wstring& value);
    void SetEvent(int index, int value);
    void SetEvent(int index, const std::string& value);
    void SetEvent(int index, const std::wstring& value);
    void SetEvent(int index, void* value);
    void SetEvent(int index, int element, int value);
    void SetEvent(int index, int element, const std::string& value);
    void SetEvent(int index, int element, const std::wstring& value);
    int GetEventArraySize(int index);
    void SetEventArraySize(int index, int size);

private:
    enum class Family { Param, Result, Event };

    // Validates an access with the requested type code and returns the
    // entry's narrow key; throws CommandDescException on failure.
    const std::string& KeyOf(Family family, int index, int requested);
    void CheckValid(Family family, int index, int type);
    void CheckValidParam(int index, int type);
    void CheckValidResult(int index, int type);
    void CheckValidEvent(int index, int type);

    // The text accessors, whose behaviour differs between the families.
    void ReadText(Family family, int index, std::wstring& value);
    void ReadText(Family family, int index, std::string& value);
    void ReadText(Family family, int index, int element, std::wstring& value);
    void ReadText(Family family, int index, int element, std::string& value);
    void WriteText(Family family, int index, const std::string& value);
    void WriteText(Family family, int index, int element, const std::string& value);

    int m_commandType;
    bool m_run;
    bool m_shield;
    bool m_execute;
    CommandDesc m_desc;
};

VANTORBASE_RESTORE_WARNINGS

#endif  // VANTORBASE_COMMAND_H
