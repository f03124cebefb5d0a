// The registry as a text file at the root of the device folder:
//
//   ; comment
//   [HKEY_LOCAL_MACHINE\SOFTWARE\Apps\Vorn Redizor Demo]
//   "InstallDir"="\Program Files\Redizor"
//
// Values are plain strings, taken as written (backslashes are not escapes). The file is read
// afresh on every RegOpenKeyExW, so a key removed while the program runs is missed at once.
#include <strings.h>

#include <cstring>
#include <fstream>
#include <map>
#include <string>

#include "platform/core/device.h"
#include "platform/core/utf.h"
#include "platform/registry.h"

namespace {

struct OpenKey {
    std::map<std::string, std::string> values;  // by lower-case value name
};

std::string Lower(std::string s) {
    for (char& c : s) {
        if (c >= 'A' && c <= 'Z') {
            c = static_cast<char>(c - 'A' + 'a');
        }
    }
    return s;
}

std::string TrimSlashes(const std::string& s) {
    std::size_t b = s.find_first_not_of('\\');
    std::size_t e = s.find_last_not_of('\\');
    return b == std::string::npos ? std::string() : s.substr(b, e - b + 1);
}

const char* RootName(HKEY root) {
    if (root == HKEY_LOCAL_MACHINE) {
        return "hkey_local_machine";
    }
    return nullptr;
}

}  // namespace

LONG RegOpenKeyExW(HKEY root, LPCWSTR subKey, DWORD options, DWORD access, HKEY* result) {
    (void)options;
    (void)access;
    if (result == nullptr) {
        return ERROR_FILE_NOT_FOUND;
    }
    *result = nullptr;
    const char* rootName = RootName(root);
    std::string file = platform::ResolveDevicePath("\\registry.txt");
    if (rootName == nullptr || file.empty()) {
        return ERROR_FILE_NOT_FOUND;
    }
    std::string wanted =
        Lower(std::string(rootName) + "\\" + TrimSlashes(platform::ToUtf8(subKey)));
    std::ifstream in(file);
    std::string line;
    bool inKey = false;
    bool found = false;
    auto* key = new OpenKey;
    while (std::getline(in, line)) {
        if (!line.empty() && line.back() == '\r') {
            line.pop_back();
        }
        if (line.empty() || line[0] == ';' || line[0] == '#') {
            continue;
        }
        if (line[0] == '[') {
            std::size_t close = line.find(']');
            inKey = close != std::string::npos &&
                    Lower(TrimSlashes(line.substr(1, close - 1))) == wanted;
            found = found || inKey;
            continue;
        }
        if (!inKey || line[0] != '"') {
            continue;
        }
        std::size_t nameEnd = line.find("\"=\"", 1);
        if (nameEnd == std::string::npos || line.back() != '"' || line.size() < nameEnd + 4) {
            continue;
        }
        std::string name = line.substr(1, nameEnd - 1);
        std::string value = line.substr(nameEnd + 3, line.size() - nameEnd - 4);
        key->values[Lower(name)] = value;
    }
    if (!found) {
        delete key;
        return ERROR_FILE_NOT_FOUND;
    }
    *result = reinterpret_cast<HKEY>(key);
    return ERROR_SUCCESS;
}

LONG RegQueryValueExW(HKEY key, LPCWSTR valueName, DWORD* reserved, DWORD* type, BYTE* data,
                      DWORD* dataSize) {
    (void)reserved;
    if (key == nullptr || key == HKEY_LOCAL_MACHINE) {
        return ERROR_FILE_NOT_FOUND;
    }
    auto* open = reinterpret_cast<OpenKey*>(key);
    auto it = open->values.find(Lower(platform::ToUtf8(valueName)));
    if (it == open->values.end()) {
        return ERROR_FILE_NOT_FOUND;
    }
    std::u16string value = platform::ToUtf16(it->second);
    DWORD needed = static_cast<DWORD>((value.size() + 1) * sizeof(WCHAR));
    if (type != nullptr) {
        *type = REG_SZ;
    }
    if (dataSize == nullptr) {
        return ERROR_MORE_DATA;
    }
    if (data == nullptr || *dataSize < needed) {
        *dataSize = needed;
        return data == nullptr ? ERROR_SUCCESS : ERROR_MORE_DATA;
    }
    std::memcpy(data, value.c_str(), needed);
    *dataSize = needed;
    return ERROR_SUCCESS;
}

LONG RegCloseKey(HKEY key) {
    if (key == nullptr || key == HKEY_LOCAL_MACHINE) {
        return ERROR_FILE_NOT_FOUND;
    }
    delete reinterpret_cast<OpenKey*>(key);
    return ERROR_SUCCESS;
}
