#include "vesk_hdl/engine/CommandHelp.h"

#include <iterator>

#include "vesk_hdl/engine/CommandTable.h"
#include "vesk_hdl/text/basis/Functions.h"

namespace Vesk_Hdl {

namespace {

#define HELP(name, Class, ...) {.keyword = name, .grammar = __VA_ARGS__},
constexpr CommandHelp COMMANDS[] = {VESK_HDL_COMMANDS(HELP)};
#undef HELP

} // namespace

int CommandReference::GetCount() { return static_cast<int>(std::size(COMMANDS)); }

CommandHelp const *CommandReference::GetAt(int index) {
    return index >= 0 && index < GetCount() ? &COMMANDS[index] : nullptr;
}

CommandHelp const *CommandReference::Find(char const *keyword) {
    for (CommandHelp const &command : COMMANDS)
        if (Basis::stricmp(command.keyword, keyword) == 0)
            return &command;
    return nullptr;
}

} // namespace Vesk_Hdl
