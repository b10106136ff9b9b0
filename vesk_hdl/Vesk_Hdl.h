#pragma once

// The whole exported interface and the types of the base layer that it uses.
//
// Where to begin reading:
// - Engine (engine/HdlEngine.h) owns designs and runs command lines and command files on them.
// - Model (model/HdlModel.h) is one design. Its operations are what the commands call.
// - Netlist (netlist/Netlist.h) is what a client walks that looks at a design.
// - VhdlNetlister and VerilogNetlister (hdl/) write a netlist as text.
// - OutStream (text/OutStream.h) is where that text goes.
// - Exception (text/Exception.h) is what every refusal throws.
//
// A client that needs one class alone includes the header of that class. Headers that this one does
// not include are not installed, apart from those of text/basis/, which Basis.h includes.

#include "vesk_hdl/engine/CommandHelp.h"
#include "vesk_hdl/engine/HdlCmd.h"
#include "vesk_hdl/engine/HdlEngine.h"
#include "vesk_hdl/engine/PinReference.h"
#include "vesk_hdl/engine/WriteArguments.h"
#include "vesk_hdl/hdl/HdlUtilities.h"
#include "vesk_hdl/hdl/NetlistHeader.h"
#include "vesk_hdl/hdl/VerilogNetlister.h"
#include "vesk_hdl/hdl/VerilogStatements.h"
#include "vesk_hdl/hdl/VhdlNetlister.h"
#include "vesk_hdl/hdl/VhdlStatements.h"
#include "vesk_hdl/model/HdlModel.h"
#include "vesk_hdl/model/HdlOptions.h"
#include "vesk_hdl/netlist/Attribute.h"
#include "vesk_hdl/netlist/Netlist.h"
#include "vesk_hdl/netlist/NetlistFwd.h"
#include "vesk_hdl/netlist/Object.h"
#include "vesk_hdl/netlist/Pin.h"
#include "vesk_hdl/netlist/Signal.h"
#include "vesk_hdl/netlist/Values.h"
#include "vesk_hdl/netlist/Vocabulary.h"
#include "vesk_hdl/netlist/passes/DummyPlan.h"
#include "vesk_hdl/text/Exception.h"
#include "vesk_hdl/text/IStringPtrMap.h"
#include "vesk_hdl/text/OutStream.h"
#include "vesk_hdl/text/PtrArray.h"
#include "vesk_hdl/text/StringArray.h"
#include "vesk_hdl/text/StringSet.h"
#include "vesk_hdl/text/basis/Basis.h"
