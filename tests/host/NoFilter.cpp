// A module that is no filter.

extern "C" void InitializePlugin() {}
