// Built into the programs that open a display. libdbus, which SDL's video start-up reaches for, keeps a read
// buffer it never frees; under LeakSanitizer that would fail every run of the game for a leak that is not ours.
#if defined(__SANITIZE_ADDRESS__)
extern "C" const char* __lsan_default_suppressions();
extern "C" const char* __lsan_default_suppressions() { return "leak:libdbus-1.so\n"; }
#endif
