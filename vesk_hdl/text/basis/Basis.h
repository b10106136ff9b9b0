#pragma once

// The whole base layer: strings, regular expressions, exceptions, files, functions on plain
// character strings, version and clock.
//
// It knows nothing of designs. The rooms above it use these types in their interfaces, so that a
// client that includes any header of them gets the ones that it needs.

#include "vesk_hdl/text/basis/Exception.h"
#include "vesk_hdl/text/basis/File.h"
#include "vesk_hdl/text/basis/Functions.h"
#include "vesk_hdl/text/basis/Regexp.h"
#include "vesk_hdl/text/basis/StringBase.h"
#include "vesk_hdl/text/basis/Timestamp.h"
#include "vesk_hdl/text/basis/Version.h"
