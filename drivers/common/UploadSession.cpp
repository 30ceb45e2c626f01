#include "UploadSession.h"

extern "C" {

SXN_DRIVER_EXPORT int sxn_driver_upload_point(sxn_session* session, const char* name,
                                              const char* code, double east, double north,
                                              double height, int has_height) {
    if (session == nullptr || name == nullptr) return 0;
    try {
        const sxn::UploadPoint point{
            name, code != nullptr ? code : "", east, north, height, has_height != 0};
        // The program hands this function only sessions that sxn_driver_upload made.
        return static_cast<UploadSession*>(session)->Point(point);
    } catch (...) {
        return -1;
    }
}

}  // extern "C"
