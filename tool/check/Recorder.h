#pragma once

#include <string>
#include <unordered_map>
#include <unordered_set>
#include <vector>

#include "tool/check/Findings.h"
#include "tool/check/LocationMap.h"
#include "tool/check/Text.h"
#include "tool/diagnostics/LineTokens.h"
#include "vesk_hdl/Vesk_Hdl.h"

namespace Checks {

/// How a scalar came to be called like one bit of a bus.
enum class Origin { DECLARED, COMPOUND, BRACKETS };

/// Watches lines run: notes what each of them makes and connects, and finds what can be seen only
/// then, such as a bus that gives way to a wider one. Before looks at the names on the line and
/// After at what has become of them, so that a line costs its own length and not the design's.
class Recorder {
public:
    Recorder(Vesk_Hdl::Model &watched, LocationMap &madePlaces, Findings &foundThings)
        : model(watched), netlist(*watched.GetNetlist()), places(madePlaces),
          findings(foundThings) {}

    /// The command is null for none; its keyword has so many words.
    void Before(LineTokens const &lineTokens, Vesk_Hdl::CommandHelp const *command, int words,
                std::uint32_t line);
    /// A line that did not run may have made a net all the same.
    void After(bool ran);

    /// Of a scalar whose name has brackets.
    Origin GetOrigin(Vesk_Hdl::Signal const *signal) const;

private:
    /// What a command does, as far as the recorder looks at it.
    enum class Kind {
        OTHER,
        CONNECT,
        ASSIGN,
        NET,
        COMPONENT,
        PIN,
        INSTANCE,
        NAME,
        ATTRIBUTE,
        TEXT
    };

    /// A net that the line names, if there is something to look at after the line: it did not
    /// exist, or it is spelled in another way.
    struct Named {
        Text name;
        int token;
        bool existed;
        Origin origin;
    };
    /// A bus that may give way, and what it would lose.
    struct Widened {
        Vesk_Hdl::Bus *bus;
        Text name;
        std::string losses;
        int firstToken; ///< that names a wider one
        int lastToken;
    };

    Kind KindOf(Vesk_Hdl::CommandHelp const *command);
    CompactLocation LocationOf(int token) const {
        return Checks::LocationOf(*tokens, token, lineNumber);
    }
    void Name(Text const &name, int token);
    bool NameOne(Text const &name, int token, Origin origin);
    void WatchBus(Text const &name, int token);
    static std::string LossesOf(Vesk_Hdl::Bus const &bus);
    void NamePin(int token);
    void NameAttribute();
    Vesk_Hdl::AttributeHolder *HolderOf(int token) const;

    void RecordNets();
    void CompareSpelling(Named const &named, Vesk_Hdl::Signal const &signal);
    void RecordPin();
    void RecordWidening(Widened const &widened);
    void RecordReturns(Widened const &widened, Vesk_Hdl::Signal &slice);
    void RecordAssignment();
    void RecordDeclaration();
    void RecordAttribute();
    void RecordText();
    void const *OwnerOfText() const;

    Vesk_Hdl::Model &model;
    Vesk_Hdl::Netlist &netlist;
    LocationMap &places;
    Findings &findings;

    // The line that runs.
    LineTokens const *tokens = nullptr;
    std::uint32_t lineNumber = 0;
    std::string_view keyword;
    Kind kind = Kind::OTHER;
    int firstArgument = 0;
    std::vector<Named> nets;
    int netCount = 0; ///< of all that the line names
    Text firstNet;
    std::vector<Widened> buses;
    std::unordered_map<Vesk_Hdl::Bus *, std::size_t> busPlaces; ///< where they are in `buses`
    Vesk_Hdl::Pin *pin = nullptr;
    Vesk_Hdl::Signal *formerNet = nullptr; ///< of the pin
    Text formerNetName;
    Vesk_Hdl::AttributeHolder *holder = nullptr;
    int attributeToken = 0;

    std::unordered_map<Vesk_Hdl::CommandHelp const *, Kind> kinds;
    std::unordered_map<Vesk_Hdl::Signal const *, Origin> origins;
    std::unordered_set<Vesk_Hdl::Signal const *> respelled;
    std::unordered_map<Vesk_Hdl::Pin *, Vesk_Hdl::Signal *> moved; ///< pins and their last nets
    /// Those of them that a net does not list, since they were tied.
    std::unordered_multimap<Vesk_Hdl::Signal *, Vesk_Hdl::Pin *> movedTies;
};

} // namespace Checks
