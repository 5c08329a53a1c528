#include "RunningWatch.h"

#include <algorithm>
#include <chrono>
#include <filesystem>
#include <set>
#include <thread>
#include <utility>

namespace fs = std::filesystem;

namespace simulator {

namespace {

constexpr const char* HAS_ENDED = "the watch has ended";
constexpr double LOOK_AGAIN_SECONDS = 0.03;

/** Names sort in the order in which the applications started. */
std::vector<std::string> namesIn(const std::string& folder) {
    std::vector<std::string> names;
    std::error_code ignored;
    for (const auto& entry : fs::directory_iterator(folder, ignored))
        if (entry.is_socket(ignored))
            names.push_back(entry.path().filename());
    std::sort(names.begin(), names.end());
    return names;
}

/** The process is the last part of an application's name. */
std::string processOf(const std::string& name) {
    return name.substr(name.rfind('-') + 1);
}

} // namespace

RunningWatch::RunningWatch(std::string folder) : _folder(std::move(folder)) {}

const std::vector<RunningWatch::Channel>& RunningWatch::faces() {
    std::vector<Channel> current;
    for (const std::string& name : namesIn(_folder)) {
        const auto known = std::find_if(_faces.begin(), _faces.end(),
                                        [&](const Channel& c) { return c->name() == name; });
        Channel face = known != _faces.end() ? *known : Channel(FaceChannel::open(_folder, name));
        if (face)
            current.push_back(std::move(face));
    }
    _faces = std::move(current);
    return _faces;
}

Reply RunningWatch::ask(const Channel& face, const Request& request) const {
    if (auto reply = face->ask(request))
        return *reply;
    return {HAS_ENDED, {}};
}

Reply RunningWatch::askFront(const Request& request) {
    while (!faces().empty()) {
        const Channel front = _faces.back();
        if (auto reply = front->ask(request))
            return *reply;
        // It ended meanwhile, and what was below it is in front.
        std::error_code ignored;
        fs::remove(fs::path(_folder) / front->name(), ignored);
    }
    return {HAS_ENDED, {}};
}

Reply RunningWatch::askWatch(const Request& request) {
    return faces().empty() ? Reply{HAS_ENDED, {}} : ask(_faces.front(), request);
}

bool RunningWatch::isChanging() {
    std::set<std::string> listening;
    for (const Channel& face : faces())
        listening.insert(processOf(face->name()));
    const auto all = _faces;
    return std::any_of(all.begin(), all.end(), [&](const Channel& face) {
        const Reply started = ask(face, {"launches"});
        return std::any_of(started.values.begin(), started.values.end(),
                           [&](const std::string& p) { return !listening.contains(p); });
    });
}

void RunningWatch::deliverSettings() {
    const auto all = faces();
    for (const Channel& face : all)
        ask(face, {"settings"});
}

std::string RunningWatch::waitStill(double seconds) {
    const double end = now() + seconds;
    // What another process has set a moment ago may not have been noticed yet.
    deliverSettings();
    std::string why = "an application comes or goes";
    while (!faces().empty()) {
        const Channel front = _faces.back();
        const double left = std::max(0.0, end - now());
        if (!isChanging()) {
            const auto reply = front->ask({"still", std::to_string(left)});
            if (reply)
                why = reply->problem;
            if (reply && why.empty() && !isChanging() && !faces().empty() && _faces.back() == front)
                return "";
        }
        if (now() >= end)
            return "the face does not stand still: " +
                   (why.empty() ? std::string("an application comes or goes") : why);
        sleep(LOOK_AGAIN_SECONDS);
    }
    return HAS_ENDED;
}

void RunningWatch::sleep(double seconds) {
    std::this_thread::sleep_for(std::chrono::duration<double>(seconds));
}

double RunningWatch::now() {
    return std::chrono::duration<double>(std::chrono::steady_clock::now().time_since_epoch())
        .count();
}

} // namespace simulator
