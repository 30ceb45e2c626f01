// A driver with one fault, chosen when it is built: BAD_MISSING_SYMBOL leaves out a function
// of the interface, BAD_WRONG_VERSION says it was built for another interface version, and
// BAD_CRASH_ON_LOAD crashes and BAD_HANG_ON_LOAD hangs while the library is being opened.
// The driver manager must refuse each by name and keep the good drivers beside it.
// OLD_VERSION_ONE is no fault: a driver of version 1 of the interface, from before the
// upload, which must still load.

#include <unistd.h>

#include <csignal>

#include "sxnedit_driver.h"

#ifdef BAD_CRASH_ON_LOAD
namespace {
struct CrashOnLoad {
    CrashOnLoad() { std::raise(SIGSEGV); }
} crash;
}  // namespace
#endif

#ifdef BAD_HANG_ON_LOAD
namespace {
struct HangOnLoad {
    HangOnLoad() {
        for (;;) pause();
    }
} hang;
}  // namespace
#endif

extern "C" {

SXN_DRIVER_EXPORT unsigned sxn_driver_api_version(void) {
#if defined(BAD_WRONG_VERSION)
    return SXN_DRIVER_API_VERSION + 1;
#elif defined(OLD_VERSION_ONE)
    return 1;
#else
    return SXN_DRIVER_API_VERSION;
#endif
}

SXN_DRIVER_EXPORT const char* sxn_driver_name(void) {
#ifdef OLD_VERSION_ONE
    return "Version One";
#else
    return "Faulty";
#endif
}

SXN_DRIVER_EXPORT const char* sxn_driver_description(void) {
    return "A driver that must be refused";
}

SXN_DRIVER_EXPORT const char* sxn_driver_extensions(void) {
    return "bad";
}

SXN_DRIVER_EXPORT sxn_session* sxn_driver_import(const sxn_host*, unsigned) {
    return nullptr;
}

SXN_DRIVER_EXPORT sxn_session* sxn_driver_download(const sxn_host*, unsigned, unsigned) {
    return nullptr;
}

#ifndef BAD_MISSING_SYMBOL
SXN_DRIVER_EXPORT int sxn_driver_translate(sxn_session*, const unsigned char*, size_t) {
    return SXN_END;
}
#endif

SXN_DRIVER_EXPORT int sxn_driver_time_out(sxn_session*, unsigned, unsigned) {
    return 1;
}

SXN_DRIVER_EXPORT void sxn_driver_finish(sxn_session*) {}

SXN_DRIVER_EXPORT void sxn_driver_abort(sxn_session*) {}

}  // extern "C"
