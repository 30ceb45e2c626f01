// sxnedit upload JOB --instrument NAME (--port P | -o OUT): the chosen points of a job in the
// instrument's format, sent over a serial port or written to a file.

#include <CLI/CLI.hpp>
#include <cstdio>
#include <memory>

#include "Commands.h"
#include "PortOptions.h"
#include "RunFiles.h"
#include "Transfer.h"
#include "instruments/PointUpload.h"
#include "instruments/UDeviceManager.h"
#include "instruments/UploadSelection.h"
#include "platform/io/ReplaceFile.h"
#include "platform/job/JobError.h"
#include "platform/job/USurveyDoc.h"
#include "platform/text/WideText.h"

namespace {

struct UploadOptions {
    std::string job;
    std::string instrument;
    std::string output;  // -o
    PortOptions link;
    std::vector<std::string> layers;
    std::vector<std::string> codes;
    std::string points;  // FROM-TO
};

std::vector<std::wstring> Wide(const std::vector<std::string>& texts) {
    std::vector<std::wstring> wide;
    for (const std::string& text : texts) wide.push_back(nedit::FromUtf8(text));
    return wide;
}

nedit::UploadSelection Selection(const UploadOptions& options) {
    nedit::UploadSelection selection;
    selection.SetLayerNames(Wide(options.layers));
    selection.SetCodeNames(Wide(options.codes));
    if (!options.points.empty()) {
        const std::size_t dash = options.points.find('-');
        const std::string from = options.points.substr(0, dash);
        const std::string to = dash == std::string::npos ? from : options.points.substr(dash + 1);
        selection.SetPointRange(nedit::FromUtf8(from), nedit::FromUtf8(to));
    }
    return selection;
}

void Say(const std::wstring& text) {
    std::fprintf(stderr, "sxnedit: %s\n", nedit::ToUtf8(text).c_str());
}

int Upload(const UploadOptions& options) {
    if (!RunFiles().Reads(options.job).Reads(options.link.port).Writes(options.output).Check()) {
        return exit_status::Failed;
    }
    std::unique_ptr<USurveyDoc> job;
    std::vector<nedit::UploadPoint> points;
    try {
        nedit::JobOpenOptions open;
        open.access = nedit::JobAccess::ReadOnly;
        job = USurveyDoc::OpenJob(options.job, open);
        points = Selection(options).Select(*job);
    } catch (const nedit::JobError& error) {
        std::fprintf(stderr, "sxnedit: %s\n", error.what());
        return exit_status::Unreadable;
    }
    if (points.empty()) {
        std::fprintf(stderr, "sxnedit: no point of %s is chosen; nothing was uploaded\n",
                     options.job.c_str());
        return exit_status::Failed;
    }
    UDeviceManager manager(L"", 0, false);
    if (const int status = LoadDriver(manager, options.instrument)) return status;
    if (!manager.CanUpload()) {
        std::fprintf(stderr, "sxnedit: the driver %s cannot upload points\n",
                     options.instrument.c_str());
        return exit_status::Failed;
    }
    const bool toFile = !options.output.empty();
    if (!toFile &&
        !manager.OpenPort(nedit::FromUtf8(options.link.port), PortSettings(options.link))) {
        Say(manager.GetLastError());
        return exit_status::Failed;
    }
    std::string bytes;
    nedit::PointUpload upload(manager, job->GetSettings().GetLengthUnit());
    const nedit::UploadOutcome outcome = upload.Run(points, toFile ? &bytes : nullptr, nullptr);
    manager.ClosePort();
    for (const std::wstring& message : outcome.messages) Say(message);
    const std::string target = toFile ? options.output : options.link.port;
    if (outcome.failed) {
        std::fprintf(stderr, "sxnedit: the upload failed after %d of %zu points%s\n", outcome.sent,
                     points.size(), toFile ? "; nothing was written" : "");
        return exit_status::Failed;
    }
    if (toFile && !nedit::ReplaceFile(options.output, bytes)) {
        std::fprintf(stderr, "sxnedit: cannot write %s\n", options.output.c_str());
        return exit_status::Failed;
    }
    std::fprintf(stderr, "sxnedit: %d points uploaded to %s", outcome.sent, target.c_str());
    if (outcome.refused > 0) {
        std::fprintf(stderr, "; %d left out, which the format cannot hold", outcome.refused);
    }
    std::fprintf(stderr, "\n");
    return outcome.refused > 0 ? exit_status::Failed : exit_status::Ok;
}

}  // namespace

void AddUploadCommand(CLI::App& app, CommandRun& run) {
    auto options = std::make_shared<UploadOptions>();
    CLI::App* upload =
        app.add_subcommand("upload",
                           "send the chosen points of JOB to an instrument in its format:\n"
                           "over a serial port, or into a file. Without choices every\n"
                           "point goes. Port values not given come from the port's\n"
                           "stored settings");
    upload->add_option("JOB", options->job, "the job")->required();
    upload->add_option("--instrument", options->instrument, "the instrument's driver")
        ->required()
        ->option_text("NAME");
    CLI::Option* port = AddPortOptions(*upload, options->link);
    CLI::Option* output = upload->add_option("-o", options->output, "write the points to this file")
                              ->option_text("OUT");
    port->excludes(output);
    upload->add_option("--layers", options->layers, "only points on these layers")
        ->delimiter(',')
        ->option_text("NAME,...");
    upload->add_option("--codes", options->codes, "only points of these feature codes")
        ->delimiter(',')
        ->option_text("CODE,...");
    upload
        ->add_option("--points", options->points,
                     "only points named FROM to TO (numbers as numbers)")
        ->option_text("FROM-TO");
    upload->callback([options, port, output, &run] {
        if (port->count() + output->count() != 1) {
            throw CLI::RequiredError("--port or -o");
        }
        run = [options] { return Upload(*options); };
    });
}
