// Each allocation of a design's life fails once: the client gets std::bad_alloc, nothing leaks (as
// the address sanitizer finds), no pointer dangles, and the engine can still be used.

#include <cerrno>
#include <new>

#include <gtest/gtest.h>

#include "tests/support/Consistency.h"
#include "tests/support/Lines.h"
#include "tests/support/MemoryFile.h"

extern long allocationsLeft; // of FailingNew.cpp
extern bool allLaterFail;

namespace {

using namespace Vesk_Hdl;

/// Every family of commands, all forms of names, widening, and writes that rewrite.
Lines AllFamilies() {
    Lines lines = CellsAnd(
        "port q out; port d(7:0) in; sig bus(7:0); q u1.Y; q u2.A; bus(3:0) u1.B(3:0); bus(0) u2.Y;"
        "bus(2),q,d(1:0) u2.B(3:0); d(7:0) u1.W(7:0); bus(15:0) q; bus(9:6) bus(3:0); u3.A = 1;"
        "u3.B(3:0) = 4:h:A; net = 0; ADD MODULE ATTRIBUTE -TYPE=Integer W 8;"
        "SET MODULE ATTRIBUTE OPTION W -GENERIC=SYN;"
        "ADD COMPONENT ATTRIBUTE CELL -TYPE=BitVector INIT 4:b:1010;"
        "SET INSTANCE ATTRIBUTE VALUE u1 INIT 4:b:0101; ADD INSTANCE PIN ATTRIBUTE u1.A K v;"
        "ADD SIGNAL ATTRIBUTE q -TYPE=User U on; SET SIGNAL ATTRIBUTE USERTYPE q U STATE;"
        "ADD NOTES some words; ADD SIGNAL COMMENT q words; ADD LIBRARY lib; ADD INCLUDE a.v;"
        "SET SYNTHESIS SYNPLICITY; SET OPEN PIN false; SET PURPOSE to fail");
    lines.insert(lines.end(), {"WRITE VERILOG x", "WRITE VHDL x"});
    return lines;
}

/// Counts files that are open, and writes that were canceled.
struct Counting : Capture {
    int Open(char const *name, bool append) override {
        ++open;
        return Capture::Open(name, append);
    }
    void Finish(WriteStatus &status) override {
        --open;
        canceled += status.error == ECANCELED;
    }
    int open = 0;
    int canceled = 0;
};

/// Runs the design. The allocation of that number fails; with allLaterFail so do all until the
/// exception arrives here. False if there were fewer allocations.
bool RunWithFailure(Lines const &lines, long number, int &canceledWrites) {
    allocationsLeft = number;
    bool failed = false;
    CommandFactory *factory = nullptr;
    Model *model = nullptr;
    Counting capture;
    while (!model) {
        try {
            if (!factory)
                factory = new CommandFactory;
            model = new Model(factory);
        } catch (std::bad_alloc const &) {
            failed = true;
            allocationsLeft = -1;
        }
    }
    model->SetWriteOpener(&capture);
    for (std::size_t i = 0; i < lines.size(); ++i) {
        std::string const &line = lines[i];
        try {
            model->Execute(line.c_str());
        } catch (std::bad_alloc const &) {
            failed = true;
            allocationsLeft = -1;
            EXPECT_EQ(capture.open, 0) << number << ": " << line;
            EXPECT_EQ(Inconsistency(*model->GetNetlist()), "") << number << ": " << line;
            --i; // run the line again: it is refused if the object was made, else it runs
        } catch (Exception const &refusal) {
            EXPECT_TRUE(failed) << line << ": " << refusal.getDescription();
        }
    }
    bool const reached = allocationsLeft < 0; // a sort that gets no memory works without it
    allocationsLeft = -1;
    EXPECT_EQ(Inconsistency(*model->GetNetlist()), "") << number;
    delete model;
    delete factory;
    canceledWrites += capture.canceled;
    return reached;
}

TEST(Faults, AnAllocationFails) {
    Lines const lines = AllFamilies();
    for (bool const all : {false, true}) {
        allLaterFail = all;
        long number = 0;
        int canceledWrites = 0;
        while (RunWithFailure(lines, number, canceledWrites) && !HasFailure())
            ++number;
        EXPECT_GT(number, 300) << all;
        EXPECT_GT(canceledWrites, 30) << all;
    }
}

} // namespace
