#pragma once

#include "vesk_hdl/Vesk_Hdl.h"

/// The keyword that the line begins with, longest first, as the engine finds it; null for none.
/// `words` becomes the number of its words.
Vesk_Hdl::CommandHelp const *KeywordOf(Vesk_Hdl::StringArray const &tokens, int &words);
