#pragma once

#include <string>

#include "tool/diagnostics/Diagnostic.h"
#include "vesk_hdl/Vesk_Hdl.h"

// Which token of a line is wrong, and what to do next. The text of the library is the message of
// the diagnostic, unchanged but for its end of line.

/// A line that the model refused. Without hints, those that search the design are left out; the
/// place is the same.
Diagnostic ExplainRefusal(std::string const &line, SourceRange const &place,
                          Basis::Exception const &refusal, Vesk_Hdl::Model const &model,
                          bool withHints = true);

/// Why a write failed, as the opener of its file or else the system says it.
std::string FailureOf(Vesk_Hdl::WriteStatus const &write);

/// A write command whose file did not reach the disk whole.
Diagnostic ExplainWrite(std::string const &line, SourceRange const &place,
                        Vesk_Hdl::WriteStatus const &write);

/// A line with a NUL byte at the index.
Diagnostic ExplainNul(std::string const &line, SourceRange const &place, std::size_t at);
