#include "Actions.h"
#include "CommandArguments.h"
#include "FacePicture.h"
#include "Recorder.h"

namespace simulator::actions {

namespace {

std::optional<int> rateIn(const Arguments& arguments) {
    if (arguments.size() < 3)
        return RECORD_USUAL;
    const auto rate = wholeNumber(arguments[2]);
    return rate && *rate >= RECORD_LEAST && *rate <= RECORD_MOST ? rate : std::nullopt;
}

} // namespace

std::string checkScreenshot(const Arguments& arguments) {
    if (arguments[0].empty())
        return "the name of a file is missing";
    return arguments.size() < 2 || arguments[1] == "square"
               ? ""
               : "'" + arguments[1] + "' is unknown: only square may follow the file";
}

std::string screenshot(ScriptRun& run, const Arguments& arguments) {
    FacePicture picture;
    std::string problem = takePicture(run.device(), picture);
    if (!problem.empty())
        return problem;
    if (arguments.size() < 2)
        cutRound(picture);
    return writePng(arguments[0], picture);
}

std::string checkRecord(const Arguments& arguments) {
    if (arguments[0] == "stop")
        return arguments.size() == 1 ? "" : "nothing follows stop";
    if (arguments[0] != "start")
        return "'" + arguments[0] + "' is neither start nor stop";
    if (arguments.size() < 2 || arguments[1].empty())
        return "the name of a file is missing";
    return rateIn(arguments)
               ? ""
               : "'" + arguments[2] + "' is no number of pictures a second from 1 to 60";
}

std::string record(ScriptRun& run, const Arguments& arguments) {
    const std::string& folder = run.device().folder();
    return arguments[0] == "stop" ? stopRecording(folder)
                                  : startRecording(folder, arguments[1], *rateIn(arguments));
}

} // namespace simulator::actions
