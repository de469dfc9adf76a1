// Built into the programs that open a display and into the host's tests. Two leaks inside system libraries
// are not ours and would fail every sanitized run: libdbus, which SDL's video start-up reaches for, keeps a
// read buffer it never frees; SDL_image's SVG loader drops the 16-byte image header of a file it cannot size.
#if defined(__SANITIZE_ADDRESS__)
extern "C" const char* __lsan_default_suppressions();
extern "C" const char* __lsan_default_suppressions() { return "leak:libdbus-1.so\nleak:IMG_LoadSizedSVG_RW\n"; }
// The system libraries keep no frame pointers: only the slow unwinder sees the loader's frame in a leak's stack.
extern "C" const char* __asan_default_options();
extern "C" const char* __asan_default_options() { return "fast_unwind_on_malloc=0"; }
#endif
