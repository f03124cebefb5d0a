// Where the device folder is when no --device is given: so that an installed game, a game
// run from its build tree and a player's own copy all find their data without options.
#pragma once

#include <string>
#include <vector>

namespace host {

struct LookupPlaces {
    std::string environment;       // $REDIZOR_DEVICE
    std::string userDataHome;      // $XDG_DATA_HOME, or ~/.local/share
    std::string installedData;     // the installed share/redizor
    std::string executableFolder;  // the folder of the running binary
};

// The candidate folders in the order they are tried.
std::vector<std::string> DeviceCandidates(const LookupPlaces& places);
// The first candidate that is a folder holding a registry file or an image folder; empty
// when none is.
std::string FindDeviceFolder(const LookupPlaces& places);
// The places of this process: its environment and binary.
LookupPlaces CurrentPlaces(const std::string& installedData);

}  // namespace host
