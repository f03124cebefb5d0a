#pragma once

// Frame handler of its screen: called once per main-loop pass while the screen is current.
void TitleFrame();
