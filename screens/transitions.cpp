#include "screens/transitions.h"

void EnterMenu() {}
void EnterEnd() {}
void EnterIntro() {}
void EnterFishing(BYTE region, BYTE difficulty) {
    (void)region;
    (void)difficulty;
}
