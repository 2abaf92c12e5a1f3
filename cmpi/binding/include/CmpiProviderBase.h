// The static object behind a factory: it holds the one provider object that
// all factories naming it share, and counts the interfaces handed out.
#pragma once

#include <atomic>

class CmpiBaseMI;

class CmpiProviderBase {
public:
    CmpiBaseMI *getBaseMI() const { return baseMI.load(); }
    void setBaseMI(CmpiBaseMI *provider) { baseMI.store(provider); }
    int incUseCount() { return ++useCount; }
    int decUseCount() { return --useCount; }
    int getUseCount() const { return useCount.load(); }

private:
    std::atomic<CmpiBaseMI *> baseMI{nullptr};
    std::atomic<int> useCount{0};
};
