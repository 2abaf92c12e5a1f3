// Serves Conf_BindingSample and Conf_BindingPeer: the objects the plain-C
// provider ConformanceC serves, built through the binding, so the tests can
// hold what the binding hands a broker against what a C provider hands it.
#include "CmpiArray.h"
#include "CmpiDateTime.h"
#include "CmpiProviderFactory.h"
#include "TestProvider.h"
#include "conformance_samples.h"

namespace {

using namespace testprovider;

constexpr const char *kSampleClass = "Conf_BindingSample";
constexpr const char *kPeerClass = "Conf_BindingPeer";

CmpiObjectPath samplePath(const CmpiString &ns, const conf_sample &sample) {
    CmpiObjectPath path(ns, kSampleClass);
    path.setKey("Name", sample.name);
    path.setKey("Label", sample.label);
    path.setKey("Slot", sample.slot);
    return path;
}

bool identifies(const CmpiObjectPath &path, const conf_sample &sample) {
    return stringKey(path, "Name") == sample.name && stringKey(path, "Label") == sample.label &&
           static_cast<CMPIUint16>(path.getKey("Slot")) == sample.slot;
}

CmpiInstance partOf(const CmpiString &ns, const conf_sample &sample) {
    CmpiObjectPath path(ns, "Conf_Part");
    path.setKey("Id", sample.part_id);
    CmpiInstance part(path);
    part.setProperty("Id", sample.part_id);
    part.setProperty("Size", sample.part_size);
    return part;
}

CmpiInstance sampleInstance(const CmpiString &ns, const conf_sample &sample) {
    CmpiInstance inst(samplePath(ns, sample));
    inst.setProperty("Name", sample.name);
    inst.setProperty("Label", sample.label);
    inst.setProperty("Slot", sample.slot);
    inst.setProperty("Text", sample.text);
    inst.setProperty("Made", sample.made);
    inst.setProperty("Missing", CmpiData(static_cast<const char *>(nullptr)));
    inst.setProperty("Enabled", sample.enabled != 0);
    inst.setProperty("Count", sample.count);
    inst.setProperty("Offset", sample.offset);
    inst.setProperty("Ratio", sample.ratio);
    inst.setProperty("Taken", CmpiDateTime(sample.taken, false));
    inst.setProperty("Uptime", CmpiDateTime(sample.uptime, true));
    CmpiArray names(CONF_NAMES_SIZE, CMPI_string);
    names[0] = CONF_NAMES_0;
    names[2] = CONF_NAMES_2;
    inst.setProperty("Names", names);
    CmpiArray counts(CONF_COUNTS_SIZE, CMPI_uint32);
    counts[0] = CONF_COUNTS_0;
    counts[3] = CONF_COUNTS_3;
    inst.setProperty("Counts", counts);
    inst.setProperty("Nothing", CmpiArray(0, CMPI_string));
    inst.setProperty("Part", partOf(ns, sample));
    return inst;
}

CmpiInstance peerInstance(const CmpiString &ns) {
    const CmpiObjectPath antecedent = samplePath(ns, conf_samples[0]);
    const CmpiObjectPath dependent = samplePath(ns, conf_samples[1]);
    CmpiObjectPath path(ns, kPeerClass);
    path.setKey("Antecedent", antecedent);
    path.setKey("Dependent", dependent);
    CmpiInstance inst(path);
    inst.setProperty("Antecedent", antecedent);
    inst.setProperty("Dependent", dependent);
    return inst;
}

class ConformanceTwin : public InstanceProvider {
public:
    ConformanceTwin(const CmpiBroker &mb, const CmpiContext &ctx)
        : CmpiBaseMI(mb, ctx), InstanceProvider(mb, ctx) {}

    CmpiStatus enumInstances(const CmpiContext &, CmpiResult &rslt, const CmpiObjectPath &cop,
                             const char **) override {
        const CmpiString ns = cop.getNameSpace();
        if (cop.classPathIsA(kSampleClass)) {
            for (const conf_sample &sample : conf_samples) rslt.returnData(sampleInstance(ns, sample));
        } else if (cop.classPathIsA(kPeerClass)) {
            rslt.returnData(peerInstance(ns));
        }
        return done(rslt);
    }

    CmpiStatus getInstance(const CmpiContext &, CmpiResult &rslt, const CmpiObjectPath &cop,
                           const char **) override {
        const CmpiString ns = cop.getNameSpace();
        CmpiInstance found;
        if (cop.classPathIsA(kSampleClass)) {
            for (const conf_sample &sample : conf_samples) {
                if (identifies(cop, sample)) found = sampleInstance(ns, sample);
            }
        } else if (cop.classPathIsA(kPeerClass) && identifies(cop.getKey("Antecedent"), conf_samples[0]) &&
                   identifies(cop.getKey("Dependent"), conf_samples[1])) {
            found = peerInstance(ns);
        }
        if (found.isNull()) return CmpiStatus(CMPI_RC_ERR_NOT_FOUND, "no such object");
        rslt.returnData(found);
        return done(rslt);
    }
};

}  // namespace

CMProviderBase(ConformanceTwin);
CMInstanceMIFactory(ConformanceTwin, ConformanceTwin)
