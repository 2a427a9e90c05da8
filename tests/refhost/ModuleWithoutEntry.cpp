// A module that is no plug-in.
extern "C" __attribute__((visibility("default"))) int GPMain_SomethingElse(void) { return 0; }
