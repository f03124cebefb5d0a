#include "platform/host/device_lookup.h"

#include <sys/stat.h>
#include <unistd.h>

#include <climits>
#include <cstdlib>

namespace host {

namespace {

bool Exists(const std::string& path) {
    struct stat st {};
    return ::stat(path.c_str(), &st) == 0;
}

bool LooksLikeDevice(const std::string& folder) {
    return Exists(folder + "/registry.txt") || Exists(folder + "/Program Files");
}

}  // namespace

std::vector<std::string> DeviceCandidates(const LookupPlaces& p) {
    std::vector<std::string> out;
    if (!p.environment.empty()) {
        out.push_back(p.environment);
    }
    if (!p.userDataHome.empty()) {
        out.push_back(p.userDataHome + "/redizor/device");
    }
    if (!p.installedData.empty()) {
        out.push_back(p.installedData + "/device");
    }
    if (!p.executableFolder.empty()) {
        out.push_back(p.executableFolder + "/../share/redizor/device");  // a moved install
        out.push_back(p.executableFolder + "/device");                   // the build tree
    }
    return out;
}

std::string FindDeviceFolder(const LookupPlaces& places) {
    for (const std::string& folder : DeviceCandidates(places)) {
        if (LooksLikeDevice(folder)) {
            return folder;
        }
    }
    return {};
}

LookupPlaces CurrentPlaces(const std::string& installedData) {
    LookupPlaces p;
    if (const char* env = std::getenv("REDIZOR_DEVICE")) {
        p.environment = env;
    }
    if (const char* xdg = std::getenv("XDG_DATA_HOME"); xdg != nullptr && *xdg == '/') {
        p.userDataHome = xdg;
    } else if (const char* home = std::getenv("HOME"); home != nullptr && *home != 0) {
        p.userDataHome = std::string(home) + "/.local/share";
    }
    p.installedData = installedData;
    char buf[PATH_MAX];
    ssize_t n = ::readlink("/proc/self/exe", buf, sizeof buf - 1);
    if (n > 0) {
        std::string exe(buf, static_cast<std::size_t>(n));
        p.executableFolder = exe.substr(0, exe.find_last_of('/'));
    }
    return p;
}

}  // namespace host
