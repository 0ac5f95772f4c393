sennet_add_fuzz_target(inventory-script SOURCES inventory-script.cc LIBS CimScriptParser)
