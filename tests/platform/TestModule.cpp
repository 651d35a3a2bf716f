// A module that is no COM server.

extern "C" int TestModuleAnswer();

extern "C" int TestModuleAnswer() {
    return 42;
}
