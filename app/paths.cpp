#include "app/paths.h"

#include "platform/dialog.h"
#include "platform/registry.h"
#include "platform/strings.h"

WCHAR g_installDir[MAX_PATH] = {};
WCHAR g_pathBuf[MAX_PATH] = {};

void ReadInstallDir() {
    HKEY key = nullptr;
    if (RegOpenKeyExW(HKEY_LOCAL_MACHINE, u"\\SOFTWARE\\Apps\\Vorn Redizor Demo", 0, KEY_ALL_ACCESS,
                      &key) != ERROR_SUCCESS) {
        MessageBoxW(nullptr, u"This is a problem in process of installation please reinstall",
                    u"Message", MB_OK);
        return;
    }
    // 255 bytes fit a directory of 126 units and its terminator; a longer one fails the query
    // and the directory read before stays in force.
    WCHAR value[128] = {};
    DWORD size = 255;
    if (RegQueryValueExW(key, u"InstallDir", nullptr, nullptr, reinterpret_cast<BYTE*>(value),
                         &size) == ERROR_SUCCESS) {
        value[127] = 0;
        lstrcpyW(g_installDir, value);
    }
    RegCloseKey(key);
}

static LPWSTR BuildPath(LPCWSTR folder, LPCWSTR fileName) {
    lstrcpyW(g_pathBuf, g_installDir);
    lstrcatW(g_pathBuf, folder);
    lstrcatW(g_pathBuf, fileName);
    return g_pathBuf;
}

LPWSTR ImagePath(LPCWSTR fileName) {
    return BuildPath(u"\\image", fileName);
}

LPWSTR SoundPath(LPCWSTR fileName) {
    return BuildPath(u"\\sound", fileName);
}
