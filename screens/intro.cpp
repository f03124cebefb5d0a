#include "screens/intro.h"

void IntroFrame() {}
