// The install directory, read from the registry, and the paths of pictures and sounds below it.
#pragma once

#include "platform/types.h"

extern WCHAR g_installDir[MAX_PATH];
extern WCHAR g_pathBuf[MAX_PATH];

void ReadInstallDir();
// Both return the one shared buffer g_pathBuf: use the result before building the next path.
LPWSTR ImagePath(LPCWSTR fileName);
LPWSTR SoundPath(LPCWSTR fileName);
