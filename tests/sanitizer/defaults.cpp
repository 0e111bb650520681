// Options the sanitizers read at start-up in the checking build, so that a test
// run by hand stops and fails on the first report as it does under ctest.
// Options given in the environment are read after these and win.

#ifndef TINTROLLA_LSAN_SUPPRESSIONS
#error "The checking build names its leak suppression file."
#endif

extern "C" {
// Stop at the first fault with exit code 23 (leaks too); also catch stack use
// after return, string reads past the end and static initialisation order.
const char* __asan_default_options() {
    return "halt_on_error=1:abort_on_error=0:exitcode=23:detect_leaks=1:detect_stack_use_after_return=1"
           ":strict_string_checks=1:check_initialization_order=1:strict_init_order=1";
}

// Built with -fno-sanitize-recover=all, so any report already ends the program.
const char* __ubsan_default_options() { return "halt_on_error=1:print_stacktrace=1"; }

// The path is quoted: the options are split at colons and blanks.
const char* __lsan_default_options() { return "suppressions='" TINTROLLA_LSAN_SUPPRESSIONS "'"; }
}
