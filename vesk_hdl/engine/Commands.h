#pragma once

#include "vesk_hdl/engine/CommandTable.h"
#include "vesk_hdl/engine/HdlCmd.h"

namespace Vesk_Hdl {

// One class for each row of the table. It stands with what it reads from its line, its arguments,
// in the file of its family: DesignCommands.cpp, AttributeCommands.cpp, OptionCommands.cpp,
// WriteCommands.cpp. All that others need is its creator.
#define VESK_HDL_DECLARE_COMMAND(keyword, Class, ...)                                              \
    inline constexpr char Class##Keyword[] = keyword;                                              \
    Command *Make##Class(Model *model, StringArray const &);
VESK_HDL_COMMANDS(VESK_HDL_DECLARE_COMMAND)
#undef VESK_HDL_DECLARE_COMMAND

} // namespace Vesk_Hdl

/// Defines a command but for its two operations. The arguments are a member, so that a command is
/// one piece of memory.
#define VESK_HDL_COMMAND(Class, Arguments)                                                         \
    class Class : public Command {                                                                 \
    public:                                                                                        \
        using Command::Command;                                                                    \
        bool ParseArguments(StringArray const &tokens) override;                                   \
        void Execute() override;                                                                   \
        char const *GetKeyword() const override { return Class##Keyword; }                         \
                                                                                                   \
    private:                                                                                       \
        [[maybe_unused]] Arguments arguments;                                                      \
    };                                                                                             \
    Command *Make##Class(Model *model, StringArray const &) { return new Class(model); }
