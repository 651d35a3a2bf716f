// Read by LeakSanitizer in every program: fontconfig keeps what it has learnt of fonts to the
// process's end; libpqxx loses the answer to a statement that fails as its connection breaks.

extern "C" const char* __lsan_default_suppressions();
extern "C" const char* __lsan_default_suppressions() {
    return "leak:libfontconfig\nleak:libpqxx";
}

extern "C" const char* __lsan_default_options();
extern "C" const char* __lsan_default_options() {
    return "print_suppressions=0";
}
