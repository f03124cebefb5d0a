// Under AddressSanitizer, leak checking is off for the desktop backend's tests: the X client
// libraries that SDL opens at run time and closes again in SDL_Quit leave a few allocations
// behind whose call frames can no longer be named, so no suppression entry can match them.
// The game's own code is leak-checked by every other test executable.
extern "C" const char* __asan_default_options() { return "detect_leaks=0"; }
