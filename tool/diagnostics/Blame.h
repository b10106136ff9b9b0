#pragma once

#include <string>

#include "tool/diagnostics/Diagnostic.h"
#include "vesk_hdl/Vesk_Hdl.h"

// Which token of a line is to blame for what the library says of it, and what to do next. The
// library's text stands first in each diagnostic, unchanged.

/// A refused line. The text is the exception's, with or without its end of line; the model is the
/// one that the line ran on.
Diagnostic BlameRefusal(std::string const &line, Place const &place, std::string text,
                        Vesk_Hdl::Model const &model);

/// Why a write failed, as the opener of its file or else the system says it.
std::string FailureOf(Vesk_Hdl::WriteStatus const &write);

/// A write command whose file did not reach the disk whole.
Diagnostic BlameWrite(std::string const &line, Place const &place,
                      Vesk_Hdl::WriteStatus const &write);

/// A line with a NUL byte at the index.
Diagnostic BlameNul(std::string const &line, Place const &place, std::size_t at);

/// The keyword that the line begins with, longest first, as the engine finds it; null for none.
/// `words` becomes the number of its words.
Vesk_Hdl::CommandHelp const *KeywordOf(Vesk_Hdl::StringArray const &tokens, int &words);
