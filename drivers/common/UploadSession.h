#pragma once
// An upload: points of a job written in an instrument's format, sent through the host. A
// driver that uploads derives its session from UploadSession, compiles UploadSession.cpp in
// (it defines sxn_driver_upload_point for it) and defines sxn_driver_upload itself.

#include <string_view>

#include "DriverSession.h"

namespace sxn {

/// One point as the program hands it over: coordinates in the linear unit of the mode.
struct UploadPoint {
    std::string_view name;
    std::string_view code;
    double east = 0.0;
    double north = 0.0;
    double height = 0.0;
    bool has_height = false;
};

}  // namespace sxn

class UploadSession : public sxn_session {
  public:
    UploadSession(const sxn_host& host, unsigned mode) : sxn_session(host, mode, 0u) {}

    /// An upload reads nothing.
    int Translate(const unsigned char*, std::size_t) override { return SXN_END; }
    void Finish() override {}

    /// 1 when the point was sent; 0 when the format cannot hold it, after a message that
    /// names it; -1 when sending failed.
    virtual int Point(const sxn::UploadPoint& point) = 0;
};
