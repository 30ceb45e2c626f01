#include "instruments/PointUpload.h"

#include "instruments/UDeviceManager.h"
#include "platform/messages/ProgressSink.h"
#include "platform/messages/Translate.h"
#include "platform/text/WideText.h"
#include "sxnedit_driver.h"

namespace nedit {

namespace {

constexpr std::size_t kProgressEvery = 256;

}  // namespace

PointUpload::PointUpload(UDeviceManager& manager, LengthUnit unit)
    : manager_(manager),
      mode_(unit == LengthUnit::Feet     ? SXN_MODE_FEET
            : unit == LengthUnit::USFeet ? SXN_MODE_US_FEET
                                         : SXN_MODE_METRES) {}

UploadOutcome PointUpload::Run(const std::vector<UploadPoint>& points, std::string* file,
                               ProgressSink* progress) {
    UploadOutcome outcome;
    const auto fail = [&] {
        outcome.failed = true;
        outcome.messages.push_back(manager_.GetLastError());
    };
    if (!manager_.StartUpload(mode_, file)) {
        fail();
        return outcome;
    }
    for (std::size_t i = 0; i < points.size(); ++i) {
        if (progress != nullptr && i % kProgressEvery == 0) {
            progress->Update(static_cast<int>(i * 100 / points.size()),
                             Translate(L"Uploading points"));
            if (progress->AbortRequested()) {
                outcome.aborted = true;
                break;
            }
        }
        const UploadPoint& point = points[i];
        const int sent = manager_.UploadPoint(ToUtf8(point.name), ToUtf8(point.code), point.east,
                                              point.north, point.height, point.hasHeight);
        if (sent < 0) {
            fail();
            break;
        }
        (sent > 0 ? outcome.sent : outcome.refused) += 1;
    }
    if (!outcome.failed && !manager_.EndUpload()) fail();
    std::vector<std::wstring> said = manager_.TakeMessages();
    said.insert(said.end(), outcome.messages.begin(), outcome.messages.end());
    outcome.messages = std::move(said);
    if (progress != nullptr && !outcome.failed)
        progress->Update(100, Translate(L"Uploading points"));
    return outcome;
}

}  // namespace nedit
