// One class behind two factories with different base objects, so the broker
// holds two objects of it: as the indication provider of Test_Event it runs
// a thread that delivers an event every period, shaped like the product's
// polling threads; as the instance provider of Test_EventCounter it reports
// how many deliveries were accepted, counted process-wide.
#include <atomic>
#include <chrono>
#include <condition_variable>
#include <mutex>
#include <thread>

#include "CmpiDateTime.h"
#include "CmpiProviderFactory.h"
#include "TestProvider.h"
#include "cmpi/cmpi_context_ext.h"

namespace {

using namespace testprovider;

constexpr const char *kEventNamespace = "root/cimv2";
constexpr auto kPeriod = std::chrono::milliseconds(20);

std::atomic<CMPIUint32> delivered{0};

void publish(const CmpiBroker &broker, const CmpiContext &ctx, CMPIUint32 sequence) {
    try {
        CmpiInstance event(CmpiObjectPath(kEventNamespace, "Test_Event"));
        event.setProperty("Sequence", sequence);
        event.setProperty("Origin", "EventProvider");
        event.setProperty("EventTime", CmpiDateTime());
        broker.deliverIndication(ctx, kEventNamespace, event);
        ++delivered;
    } catch (const CmpiStatus &) {
        // A refused event, or one the broker could not build, is skipped; the next period tries again.
    }
}

void releaseThreadObjects(const CmpiContext &ctx) {
    const CMPIContext *handle = ctx.getEnc();
    reinterpret_cast<const CMPIContextExtFT *>(handle->ft)->releaseThreadObjects(handle);
}

class EventProvider : public InstanceProvider, public CmpiIndicationMI {
public:
    EventProvider(const CmpiBroker &mb, const CmpiContext &ctx)
        : CmpiBaseMI(mb, ctx), InstanceProvider(mb, ctx), CmpiIndicationMI(mb, ctx) {}

    ~EventProvider() override { stop(); }

    CmpiStatus enumInstances(const CmpiContext &, CmpiResult &rslt, const CmpiObjectPath &cop,
                             const char **properties) override {
        CmpiObjectPath path(cop.getNameSpace(), "Test_EventCounter");
        path.setKey("Name", "events");
        CmpiInstance counter(path);
        counter.setPropertyFilter(properties, nullptr);
        counter.setProperty("Name", "events");
        counter.setProperty("Delivered", delivered.load());
        rslt.returnData(counter);
        return done(rslt);
    }

    // A subscription activates its filter before enabling indications.
    CmpiStatus activateFilter(const CmpiContext &, const CmpiSelectExp &, const char *,
                              const CmpiObjectPath &, bool) override {
        return CmpiStatus(CMPI_RC_OK);
    }

    CmpiStatus deActivateFilter(const CmpiContext &, const CmpiSelectExp &, const char *,
                                const CmpiObjectPath &, bool) override {
        return CmpiStatus(CMPI_RC_OK);
    }

    CmpiStatus enableIndications(const CmpiContext &ctx) override {
        const std::lock_guard<std::mutex> control(controlMutex);
        if (worker.joinable()) return CmpiStatus(CMPI_RC_OK);
        stopping = false;  // no thread runs to read it
        worker = std::thread(&EventProvider::run, this, broker, broker.prepareAttachThread(ctx));
        return CmpiStatus(CMPI_RC_OK);
    }

    CmpiStatus disableIndications(const CmpiContext &) override {
        stop();
        return CmpiStatus(CMPI_RC_OK);
    }

private:
    void run(const CmpiBroker threadBroker, const CmpiContext ctx) {
        try {
            threadBroker.attachThread(ctx);
        } catch (const CmpiStatus &) {
            return;
        }
        std::unique_lock<std::mutex> lock(mutex);
        for (CMPIUint32 sequence = 0; !stopping; ++sequence) {
            publish(threadBroker, ctx, sequence);
            releaseThreadObjects(ctx);
            wake.wait_for(lock, kPeriod, [this] { return stopping; });
        }
        lock.unlock();
        try {
            threadBroker.detachThread(ctx);
        } catch (const CmpiStatus &) {
            // The thread ends either way.
        }
    }

    void stop() {
        const std::lock_guard<std::mutex> control(controlMutex);
        {
            const std::lock_guard<std::mutex> lock(mutex);
            stopping = true;
        }
        wake.notify_all();
        if (worker.joinable()) worker.join();
    }

    std::mutex controlMutex;  // serializes starting and stopping the thread
    std::mutex mutex;         // held by the thread except while it waits
    std::condition_variable wake;
    bool stopping = false;
    std::thread worker;
};

}  // namespace

CMProviderBase(EventProvider);
CMProviderBase(EventStore);
CMIndicationMIFactory(EventProvider, EventProvider)
CMInstanceMIFactory(EventProvider, EventStore)
