/**
 * @file
 * @brief A watch that runs in another process.
 */
#pragma once

#include <memory>
#include <string>
#include <vector>

#include "Device.h"
#include "FaceChannel.h"

namespace simulator {

/** The watch whose applications listen in a folder. */
class RunningWatch : public Device {
public:
    explicit RunningWatch(std::string folder);

    const std::string& folder() const override { return _folder; }
    Reply askFront(const Request& request) override;
    Reply askWatch(const Request& request) override;
    std::string waitStill(double seconds) override;
    void sleep(double seconds) override;
    double now() override;

private:
    using Channel = std::shared_ptr<FaceChannel>;

    /** The applications that run, the first started first. */
    const std::vector<Channel>& faces();
    Reply ask(const Channel& face, const Request& request) const;
    /** True while an application that was started does not listen yet, or goes. */
    bool isChanging();
    /** Returns when every application has noticed the settings that were made before. */
    void deliverSettings();

    std::string _folder;
    std::vector<Channel> _faces;
};

} // namespace simulator
