/**
 * @file
 * @brief The modems of this computer, as oFono knows them.
 */
#pragma once

#include <optional>
#include <string>
#include <vector>

namespace host {

/** A modem and the network it is on. */
struct Modem {
    std::string name;
    /** Country code and network code; empty without a network, nothing when it did not answer. */
    std::optional<std::string> plmn;
};

/**
 * @brief Asks oFono for the modems; takes 300 milliseconds at most.
 * @return Nothing when oFono does not answer; an empty list when there is no oFono or no modem.
 */
std::optional<std::vector<Modem>> askModems();

} // namespace host
