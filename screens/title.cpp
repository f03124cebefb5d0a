#include "screens/title.h"

void TitleFrame() {}
