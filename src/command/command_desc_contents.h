// What copies of a CommandDesc share.
#ifndef VANTORBASE_SRC_COMMAND_COMMAND_DESC_CONTENTS_H
#define VANTORBASE_SRC_COMMAND_COMMAND_DESC_CONTENTS_H

#include <list>
#include <string>
#include <vector>

#include "vantorbase/command_desc.h"

namespace vantorbase::detail {

// One of the three lists of entries. The standard list is what GetAt walks;
// the vector beside it holds the same entries for lookup by index in
// constant time. The list owns its entries.
struct EntryList {
    std::list<CommandParamDesc*> entries;
    std::vector<CommandParamDesc*> byIndex;

    CommandParamDesc* At(int index) const noexcept {
        return index >= 0 && static_cast<size_t>(index) < byIndex.size()
                   ? byIndex[static_cast<size_t>(index)]
                   : nullptr;
    }
    int Count() const noexcept { return static_cast<int>(byIndex.size()); }
};

struct CommandDescContents {
    CommandDescContents() = default;
    CommandDescContents(const CommandDescContents&) = delete;
    CommandDescContents& operator=(const CommandDescContents&) = delete;
    ~CommandDescContents();

    std::wstring name = L"unknown";
    std::wstring description;
    EntryList params;
    EntryList results;
    EntryList events;
};

}  // namespace vantorbase::detail

#endif  // VANTORBASE_SRC_COMMAND_COMMAND_DESC_CONTENTS_H
