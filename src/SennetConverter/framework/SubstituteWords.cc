// The abbreviation table; entry i of one array belongs to entry i of the other.

#include "SennetConverter/framework/SennetUtilities.h"

namespace Pegasus {

const String SennetUtilities::substituteKeysArray[numSubstituteKeys] = {
    "activation",   "address",      "administrator", "architecture", "available",   "block",
    "bridge",       "change",       "component",     "config",       "connections", "console",
    "controller",   "conventional", "coprocessor",   "description",  "device",      "directory",
    "distribution", "drive",        "driver",        "drivers",      "faxmodem",    "filepack",
    "filesystem",   "floppydrive",  "harddisk",      "hardware",     "history",     "installation",
    "installed",    "internet",     "interrupt",     "kernel",       "language",    "lastscan",
    "logicaldrive", "memory",       "netware",       "network",      "number",      "platform",
    "profile",      "relationship", "resolution",    "restrict",     "rwoptical",   "security",
    "serial",       "serialnumber", "service",       "signature",    "software",    "start",
    "support",      "system",       "systems",       "version",      "video",       "virtual",
    "volume",       "volumelabel",
};

const String SennetUtilities::substituteValuesArray[numSubstituteKeys] = {
    "ACTIV",   "ADDR",  "ADMIN", "ARCH",  "AVAIL",  "BLK",    "BRG",     "CHG",      "COMP",
    "CFG",     "CONX",  "CONS",  "CNTRL", "CONV",   "COPROC", "DESCRIP", "DEV",      "DIR",
    "DIST",    "DRV",   "DRV",   "DRVS",  "FMODEM", "FPACK",  "FILESYS", "FLPY_DRV", "HDISK",
    "HWARE",   "HIST",  "INSTL", "INST",  "INET",   "INT",    "KRNL",    "LANG",     "LSCAN",
    "LOG_DRV", "MEM",   "NWARE", "NET",   "NUM",    "PLTFRM", "PRFL",    "REL",      "RES",
    "RSTRT",   "RWOPT", "SEC",   "SER",   "SERNUM", "SVC",    "SIG",     "SW",       "ST",
    "SUPP",    "SYS",   "SYS",   "VER",   "VID",    "VIRT",   "VOL",     "VOLLABEL",
};

}  // namespace Pegasus
