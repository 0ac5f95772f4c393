#pragma once

// The run: command line, directories, the loop over the inventory scripts.

#include <Pegasus/Client/CIMClient.h>
#include <Velm/Properties.h>

#include "SennetConverter/framework/CimInstanceLists.h"

/// True for "/SMS", "/CA", "/QVE" and "/LD", exactly so.
bool isValidMIFType(const Pegasus::String& type);

/// True when there is a class and some list holds an instance.
bool somethingToPrintOut(const Pegasus::Array<Pegasus::CIMClass>& classes,
                         const Pegasus::CimInstanceLists& instanceLists);

/// The value stored under key, or key itself. The text lives as long as the set that the argument
/// was copied from, or as key.
const char* getTranslatedString(const char* key, Velm::Properties properties);

/// The whole program: main's arguments, its exit status. Messages go to standard output, failures
/// to connect and malformed scripts are silent.
int runSennet(int argc, char** argv);
