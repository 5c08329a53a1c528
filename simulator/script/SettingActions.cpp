// Commands that the watch itself does, whatever application is in front.
#include <cstdio>

#include "Actions.h"

namespace simulator::actions {

std::string set(ScriptRun& run, const Arguments& arguments) {
    return run.device().askWatch({"set", arguments[0], arguments[1]}).problem;
}

std::string get(ScriptRun& run, const Arguments& arguments) {
    const Reply reply = run.device().askWatch({"get", arguments[0]});
    if (reply.problem.empty() && !reply.values.empty())
        std::puts(reply.values.front().c_str());
    return reply.problem;
}

std::string expectSetting(ScriptRun& run, const Arguments& arguments) {
    const Reply reply = run.device().askWatch({"get", arguments[0]});
    if (!reply.problem.empty())
        return reply.problem;
    const std::string value = reply.values.empty() ? "" : reply.values.front();
    return value == arguments[1] ? "" : "it is '" + value + "'";
}

std::string checkQuickPanel(const Arguments& arguments) {
    return arguments[0] == "open" || arguments[0] == "close"
               ? ""
               : "'" + arguments[0] + "' is neither open nor close";
}

std::string quickPanel(ScriptRun& run, const Arguments& arguments) {
    return run.device().askWatch({"quick-panel", arguments[0]}).problem;
}

std::string background(ScriptRun& run, const Arguments& /*arguments*/) {
    return run.device().askWatch({"background"}).problem;
}

std::string foreground(ScriptRun& run, const Arguments& /*arguments*/) {
    return run.device().askWatch({"foreground"}).problem;
}

} // namespace simulator::actions
