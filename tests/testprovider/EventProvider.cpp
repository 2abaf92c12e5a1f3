// One class behind two factories with different base objects, so the broker
// holds two objects of it: as the indication provider of Test_Event it runs
// a thread that delivers an event every period, shaped like the product's
// polling threads; as the instance provider of Test_EventCounter it reports
// what became of the deliveries, counted process-wide.
#include <atomic>
#include <chrono>
#include <condition_variable>
#include <memory>
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
std::atomic<CMPIUint32> refused{0};

struct StartRecord {
    CmpiBroker broker;
    CmpiContext context;
};

void publish(const CmpiBroker &broker, const CmpiContext &ctx, CMPIUint32 sequence) {
    CmpiInstance event(CmpiObjectPath(kEventNamespace, "Test_Event"));
    event.setProperty("Sequence", sequence);
    event.setProperty("Origin", "EventProvider");
    event.setProperty("EventTime", CmpiDateTime());
    try {
        broker.deliverIndication(ctx, kEventNamespace, event);
        ++delivered;
    } catch (const CmpiStatus &) {
        ++refused;
    }
}

void releaseThreadObjects(const CmpiContext &ctx) {
    const CMPIContext *handle = ctx.getEnc();
    reinterpret_cast<const CMPIContextExtFT *>(handle->ft)->releaseThreadObjects(handle);
}

class EventProvider : public InstanceProvider, public CmpiIndicationMI {
public:
    EventProvider(const CmpiBroker &mb, const CmpiContext &ctx)
        : CmpiBaseMI(mb, ctx),
          InstanceProvider(mb, ctx, ProviderClass::Event),
          CmpiIndicationMI(mb, ctx) {}

    ~EventProvider() override { stop(); }

    CmpiStatus cleanup(const CmpiContext &, bool terminating) override {
        if (!terminating) return CmpiStatus(CMPI_RC_NEVER_UNLOAD);
        stop();
        return CmpiStatus(CMPI_RC_OK);
    }

    CmpiStatus enumInstances(const CmpiContext &, CmpiResult &rslt, const CmpiObjectPath &cop,
                             const char **properties) override {
        CmpiObjectPath path(cop.getNameSpace(), "Test_EventCounter");
        path.setKey("Name", "events");
        CmpiInstance counter(path);
        counter.setPropertyFilter(properties, nullptr);
        counter.setProperty("Name", "events");
        counter.setProperty("Delivered", delivered.load());
        counter.setProperty("Refused", refused.load());
        rslt.returnData(counter);
        rslt.returnDone();
        return CmpiStatus(CMPI_RC_OK);
    }

    CmpiStatus authorizeFilter(const CmpiContext &, const CmpiSelectExp &filter,
                               const char *className, const CmpiObjectPath &,
                               const char *owner) override {
        return owner == nullptr ? missingArguments() : checkFilter(filter, className);
    }

    CmpiStatus mustPoll(const CmpiContext &, const CmpiSelectExp &filter, const char *className,
                        const CmpiObjectPath &) override {
        return checkFilter(filter, className);
    }

    CmpiStatus activateFilter(const CmpiContext &, const CmpiSelectExp &filter,
                              const char *className, const CmpiObjectPath &, bool) override {
        return checkFilter(filter, className);
    }

    CmpiStatus deActivateFilter(const CmpiContext &, const CmpiSelectExp &filter,
                                const char *className, const CmpiObjectPath &, bool) override {
        return checkFilter(filter, className);
    }

    CmpiStatus enableIndications(const CmpiContext &ctx) override {
        const std::lock_guard<std::mutex> control(controlMutex);
        if (worker.joinable()) return CmpiStatus(CMPI_RC_OK);
        {
            const std::lock_guard<std::mutex> lock(mutex);
            stopping = false;
        }
        auto start = std::make_unique<StartRecord>(StartRecord{broker, broker.prepareAttachThread(ctx)});
        worker = std::thread(&EventProvider::run, this, std::move(start));
        return CmpiStatus(CMPI_RC_OK);
    }

    CmpiStatus disableIndications(const CmpiContext &) override {
        stop();
        return CmpiStatus(CMPI_RC_OK);
    }

private:
    // A filter operation answers OK once its arguments have reached it.
    static CmpiStatus checkFilter(const CmpiSelectExp &filter, const char *className) {
        if (className == nullptr || filter.getString().isNull()) return missingArguments();
        return CmpiStatus(CMPI_RC_OK);
    }

    static CmpiStatus missingArguments() {
        return CmpiStatus(CMPI_RC_ERR_INVALID_PARAMETER, "filter arguments missing");
    }

    void run(std::unique_ptr<StartRecord> start) {
        const CmpiBroker threadBroker = start->broker;
        const CmpiContext ctx = start->context;
        start.reset();
        try {
            threadBroker.attachThread(ctx);
        } catch (const CmpiStatus &) {
            return;
        }
        std::unique_lock<std::mutex> lock(mutex);
        for (CMPIUint32 sequence = 0; !stopping; ++sequence) {
            try {
                publish(threadBroker, ctx, sequence);
            } catch (const CmpiStatus &) {
                // An event the broker could not build is skipped; the next period tries again.
            }
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
