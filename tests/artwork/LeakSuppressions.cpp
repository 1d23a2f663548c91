// fontconfig keeps its configuration and what it matched until the process ends, where the leak checker
// cannot see the pointers to them.
extern "C" char const *__lsan_default_suppressions();
extern "C" char const *__lsan_default_suppressions() { return "leak:libfontconfig.so\n"; }
