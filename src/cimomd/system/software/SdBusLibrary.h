#pragma once

// libsystemd's D-Bus client, loaded when it is needed first: with all it depends on it takes longer
// to load than everything else of this program, and most inventories never ask for services.

#include <systemd/sd-bus.h>

namespace cimomd {

/// The functions by their names in sd-bus(3), without the prefix.
struct SdBusLibrary {
    /// Nullptr when the library is not installed. It is never unloaded.
    static const SdBusLibrary* get();

    decltype(&::sd_bus_new) busNew = nullptr;
    decltype(&::sd_bus_set_address) setAddress = nullptr;
    decltype(&::sd_bus_set_bus_client) setBusClient = nullptr;
    decltype(&::sd_bus_start) start = nullptr;
    decltype(&::sd_bus_call_async) callAsync = nullptr;
    decltype(&::sd_bus_process) process = nullptr;
    decltype(&::sd_bus_wait) wait = nullptr;
    decltype(&::sd_bus_close_unref) closeUnref = nullptr;
    decltype(&::sd_bus_message_new_method_call) messageNewMethodCall = nullptr;
    decltype(&::sd_bus_message_set_auto_start) messageSetAutoStart = nullptr;
    decltype(&::sd_bus_message_ref) messageRef = nullptr;
    decltype(&::sd_bus_message_unref) messageUnref = nullptr;
    decltype(&::sd_bus_message_get_error) messageGetError = nullptr;
    decltype(&::sd_bus_message_enter_container) messageEnterContainer = nullptr;
    decltype(&::sd_bus_message_exit_container) messageExitContainer = nullptr;
    decltype(&::sd_bus_message_read_basic) messageReadBasic = nullptr;

  private:
    bool load();
};

}  // namespace cimomd
