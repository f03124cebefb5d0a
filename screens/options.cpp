#include "screens/options.h"

void OptionsFrame() {}
