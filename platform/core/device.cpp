#include "platform/core/device.h"

#include <dirent.h>
#include <strings.h>
#include <sys/stat.h>

#include <vector>

namespace platform {

namespace {

std::string g_root = ".";
long long g_readFailureOffset = -1;

bool Exists(const std::string& path) {
    struct stat st {};
    return ::stat(path.c_str(), &st) == 0;
}

// The entry of folder whose name equals name without regard to ASCII case; empty if none.
std::string FindEntry(const std::string& folder, const std::string& name) {
    std::string exact = folder + "/" + name;
    if (Exists(exact)) {
        return exact;
    }
    DIR* dir = ::opendir(folder.c_str());
    if (dir == nullptr) {
        return {};
    }
    std::string found;
    while (dirent* entry = ::readdir(dir)) {
        if (::strcasecmp(entry->d_name, name.c_str()) == 0) {
            found = folder + "/" + entry->d_name;
            break;
        }
    }
    ::closedir(dir);
    return found;
}

}  // namespace

void InjectReadFailure(long long offset) {
    g_readFailureOffset = offset;
}

long long InjectedReadFailure() {
    return g_readFailureOffset;
}

void SetDeviceRoot(const std::string& hostFolder) {
    g_root = hostFolder.empty() ? "." : hostFolder;
}

const std::string& DeviceRoot() {
    return g_root;
}

std::string ResolveDevicePath(const std::string& devicePath) {
    std::vector<std::string> names;
    std::string name;
    for (char c : devicePath) {
        if (c == '\\' || c == '/') {
            if (!name.empty()) {
                names.push_back(name);
            }
            name.clear();
        } else {
            name += c;
        }
    }
    if (!name.empty()) {
        names.push_back(name);
    }
    std::string path = g_root;
    for (const std::string& n : names) {
        if (n == "." || n == "..") {
            return {};  // the device has no parent of its root to escape to
        }
        path = FindEntry(path, n);
        if (path.empty()) {
            return {};
        }
    }
    return path;
}

}  // namespace platform
