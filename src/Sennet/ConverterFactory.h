#pragma once

#include <Pegasus/Client/CIMClient.h>
#include <Velm/Properties.h>

#include "SennetConverter/framework/CimConverterList.h"

/// Prepares the converters for the next script: /SMS and /LD get a new one per script, /CA keeps
/// one for the whole run, /QVE keeps its two MIF converters and gets six new others. A converter
/// that is replaced is deleted, which completes or removes its file.
/// @param converters    the run's list, carried from script to script
/// @param mifType       "/SMS", "/LD", "/CA" or "/QVE" in any case; other texts change nothing
/// @param scriptName    base name of the script, part of the per-script file names
/// @param properties    outlives every printOutput of the converters
void createCimConverters(Pegasus::CimConverterList& converters, const Pegasus::String& mifType,
                         const Pegasus::String& mifDirectory, const Pegasus::String& sqlDirectory,
                         const Pegasus::String& scriptName, const Velm::Properties& properties);
