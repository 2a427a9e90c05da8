// Requests for more memory than there is are part of the tests: a sanitizer's allocator, which asks this
// function, is to refuse them like any other, instead of ending the program.
extern "C" __attribute__((visibility("default"))) const char* __asan_default_options();
extern "C" const char* __asan_default_options() { return "allocator_may_return_null=1"; }
