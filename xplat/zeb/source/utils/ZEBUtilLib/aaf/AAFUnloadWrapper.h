#pragma once
/// Its one static instance unloads the AAF library when the process ends.
class AAFUnloadWrapper {
public:
    ~AAFUnloadWrapper();
};

extern AAFUnloadWrapper g_GuarenteeAAFUnload;
