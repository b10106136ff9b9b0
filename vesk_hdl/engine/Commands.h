#pragma once

#include "vesk_hdl/engine/CommandTable.h"
#include "vesk_hdl/engine/HdlCmd.h"

namespace Vesk_Hdl {

// One class for each row of the table. What a command reads from its line is its struct Arguments,
// which stands with the bodies in the file of its family: DesignCommands.cpp,
// AttributeCommands.cpp, OptionCommands.cpp, WriteCommands.cpp. GetKeyword comes from the table, in
// HdlCmd.cpp.
#define VESK_HDL_DECLARE_COMMAND(keyword, Class, ...)                                              \
    class Class : public Command {                                                                 \
    public:                                                                                        \
        explicit Class(Model *owner);                                                              \
        ~Class() override;                                                                         \
        bool ParseArguments(StringArray const &tokens) override;                                   \
        void Execute() override;                                                                   \
        char const *GetKeyword() const override;                                                   \
                                                                                                   \
    private:                                                                                       \
        struct Arguments;                                                                          \
        std::unique_ptr<Arguments> arguments;                                                      \
    };
VESK_HDL_COMMANDS(VESK_HDL_DECLARE_COMMAND)
#undef VESK_HDL_DECLARE_COMMAND

} // namespace Vesk_Hdl

/// Construction and destruction of a command, where its Arguments are known.
#define VESK_HDL_COMMAND_LIFE(Class)                                                               \
    Class::Class(Model *owner) : Command(owner), arguments(std::make_unique<Arguments>()) {}       \
    Class::~Class() = default;
