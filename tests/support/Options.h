#pragma once

#include <string>
#include <utility>
#include <vector>

#include "vesk_hdl/Vesk_Hdl.h"

/// All fields of the options but the macro flag, by name.
inline std::vector<std::pair<std::string, std::string>> Fields(Vesk_Hdl::HdlOptions const &o) {
    Vesk_Hdl::HdlOptions::VhdlOption const &v = o.vhdlOption;
    Vesk_Hdl::HdlOptions::VerilogOption const &w = o.verilogOption;
    std::vector<std::pair<std::string, std::string>> fields;
    using Number = std::pair<char const *, int>;
    for (auto const &[name, value] :
         {Number{"noconfig", v.suppressConfiguration}, Number{"flat", v.flattenBus},
          Number{"default", v.useDefaultLibrary}, Number{"type", v.useAttrType},
          Number{"open", v.openPin}, Number{"nocomp", v.suppressComponent},
          Number{"syn", w.synthesisType}, Number{"signal", w.signalCase},
          Number{"instance", w.instanceCase}, Number{"component", w.componentCase},
          Number{"header", o.writeHeader}, Number{"oneperline", o.portOnePerLine}})
        fields.emplace_back(name, std::to_string(value));
    using List = std::pair<char const *, Vesk_Hdl::StringArray const *>;
    for (auto const &[name, list] :
         {List{"lib", &v.libraries}, List{"use", &v.useLibraries}, List{"include", &w.includes}})
        fields.emplace_back(name, list->Concatenate("|").GetText());
    using Text = std::pair<char const *, Basis::StringBase<char> const *>;
    for (auto const &[name, text] :
         {Text{"app", &o.application}, Text{"command", &o.commandStr}, Text{"device", &o.device},
          Text{"purpose", &o.purpose}, Text{"reference", &o.reference}})
        fields.emplace_back(name, text->GetText());
    return fields;
}

/// The fields that differ from the defaults: "flat=1 lib=a|b".
inline std::string Changed(Vesk_Hdl::HdlOptions const &options) {
    auto const initial = Fields(Vesk_Hdl::HdlOptions());
    auto const now = Fields(options);
    std::string text;
    for (std::size_t i = 0; i < now.size(); ++i)
        if (now[i] != initial[i])
            text += (text.empty() ? "" : " ") + now[i].first + "=" + now[i].second;
    return text;
}
