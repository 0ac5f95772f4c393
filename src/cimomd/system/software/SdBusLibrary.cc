#include "system/software/SdBusLibrary.h"

#include <dlfcn.h>

namespace cimomd {
namespace {

template <typename Function>
bool find(void* library, const char* name, Function& function) {
    function = reinterpret_cast<Function>(::dlsym(library, name));
    return function != nullptr;
}

}  // namespace

const SdBusLibrary* SdBusLibrary::get() {
    static SdBusLibrary library;
    static const bool isLoaded = library.load();
    return isLoaded ? &library : nullptr;
}

bool SdBusLibrary::load() {
    void* library = ::dlopen("libsystemd.so.0", RTLD_NOW | RTLD_LOCAL);
    return library != nullptr && find(library, "sd_bus_new", busNew) &&
           find(library, "sd_bus_set_address", setAddress) &&
           find(library, "sd_bus_set_bus_client", setBusClient) &&
           find(library, "sd_bus_start", start) && find(library, "sd_bus_call_async", callAsync) &&
           find(library, "sd_bus_process", process) && find(library, "sd_bus_wait", wait) &&
           find(library, "sd_bus_close_unref", closeUnref) &&
           find(library, "sd_bus_message_new_method_call", messageNewMethodCall) &&
           find(library, "sd_bus_message_set_auto_start", messageSetAutoStart) &&
           find(library, "sd_bus_message_ref", messageRef) &&
           find(library, "sd_bus_message_unref", messageUnref) &&
           find(library, "sd_bus_message_get_error", messageGetError) &&
           find(library, "sd_bus_message_enter_container", messageEnterContainer) &&
           find(library, "sd_bus_message_exit_container", messageExitContainer) &&
           find(library, "sd_bus_message_read_basic", messageReadBasic);
}

}  // namespace cimomd
