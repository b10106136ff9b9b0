#pragma once

// The base layer whole: strings, expressions, exceptions, files, plain functions, version, clock.

#include "vesk_hdl/text/basis/Exception.h"
#include "vesk_hdl/text/basis/File.h"
#include "vesk_hdl/text/basis/Functions.h"
#include "vesk_hdl/text/basis/Regexp.h"
#include "vesk_hdl/text/basis/StringBase.h"
#include "vesk_hdl/text/basis/Timestamp.h"
#include "vesk_hdl/text/basis/Version.h"
