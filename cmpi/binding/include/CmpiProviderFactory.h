// The exported factories through which a broker obtains a provider's
// management interfaces. CMProviderBase(pn) defines the static base object
// `base<pn>`; each factory macro defines `<pn>_Create_<Kind>MI` with its own
// function table, named "<kind><pn>", and its own interface object.
//
// Every factory call: wraps the context; points its interface object at its
// table; creates, attaches and initializes the provider when the base object
// has none yet (initialize's status is not looked at, so a provider whose
// initialization failed is still served, but one whose initialize throws is
// deleted and the exception goes on); records it in the base object;
// instance factories then write one line to standard error; finally the
// interface's handle is set to the provider, the use count is raised and the
// interface is returned.
#pragma once

#include <cstdio>
#include <memory>
#include <typeinfo>

#include "CmpiAssociationMI.h"
#include "CmpiBaseMI.h"
#include "CmpiIndicationMI.h"
#include "CmpiInstanceMI.h"
#include "CmpiProviderBase.h"

#define CMPI_FACTORY_EXPORT extern "C" __attribute__((visibility("default")))

#define CMProviderBase(pn) CmpiProviderBase base##pn

// The steps every factory shares; `announce` runs between recording the
// provider and handing it out.
#define CMPI_FACTORY_BODY(cn, pn, MIType, table, announce)                   \
    static MIType mi;                                                        \
    CmpiContext context(ctx);                                                \
    mi.ft = &table;                                                          \
    CmpiBaseMI *provider = base##pn.getBaseMI();                             \
    if (provider == nullptr) {                                               \
        CmpiBroker wrappedBroker(broker);                                    \
        std::unique_ptr<CmpiBaseMI> created(new cn(wrappedBroker, context)); \
        created->setProviderBase(&base##pn);                                 \
        created->initialize(context);                                        \
        provider = created.release();                                        \
        base##pn.setBaseMI(provider);                                        \
    }                                                                        \
    announce;                                                                \
    mi.hdl = provider;                                                       \
    base##pn.incUseCount();                                                  \
    return &mi;

#define CMInstanceMIFactory(cn, pn)                                                          \
    CMPI_FACTORY_EXPORT CMPIInstanceMI *pn##_Create_InstanceMI(                              \
        CMPIBroker *broker, const CMPIContext *ctx, CMPIStatus * /*rc*/) {                   \
        static const CMPIInstanceMIFT table = {                                              \
            CMPICurrentVersion,                 CMPICurrentVersion,                          \
            "instance" #pn,                     CmpiBaseMI::driveBaseCleanup,                \
            CmpiInstanceMI::driveEnumInstanceNames, CmpiInstanceMI::driveEnumInstances,      \
            CmpiInstanceMI::driveGetInstance,   CmpiInstanceMI::driveCreateInstance,         \
            CmpiInstanceMI::driveSetInstance,   CmpiInstanceMI::driveDeleteInstance,         \
            CmpiInstanceMI::driveExecQuery};                                                 \
        CMPI_FACTORY_BODY(cn, pn, CMPIInstanceMI, table,                                     \
                          std::fprintf(stderr, "--- _Create_InstanceMI() %s\n",              \
                                       typeid(CmpiBaseMI *).name()))                         \
    }

#define CMAssociationMIFactory(cn, pn)                                                       \
    CMPI_FACTORY_EXPORT CMPIAssociationMI *pn##_Create_AssociationMI(                        \
        CMPIBroker *broker, const CMPIContext *ctx, CMPIStatus * /*rc*/) {                   \
        static const CMPIAssociationMIFT table = {                                           \
            CMPICurrentVersion,                     CMPICurrentVersion,                      \
            "association" #pn,                      CmpiBaseMI::driveBaseCleanup,            \
            CmpiAssociationMI::driveAssociators,    CmpiAssociationMI::driveAssociatorNames, \
            CmpiAssociationMI::driveReferences,     CmpiAssociationMI::driveReferenceNames}; \
        CMPI_FACTORY_BODY(cn, pn, CMPIAssociationMI, table, (void)0)                         \
    }

#define CMIndicationMIFactory(cn, pn)                                                           \
    CMPI_FACTORY_EXPORT CMPIIndicationMI *pn##_Create_IndicationMI(                             \
        CMPIBroker *broker, const CMPIContext *ctx, CMPIStatus * /*rc*/) {                      \
        static const CMPIIndicationMIFT table = {                                               \
            CMPICurrentVersion,                       CMPICurrentVersion,                       \
            "indication" #pn,                         CmpiBaseMI::driveBaseCleanup,             \
            CmpiIndicationMI::driveAuthorizeFilter,   CmpiIndicationMI::driveMustPoll,          \
            CmpiIndicationMI::driveActivateFilter,    CmpiIndicationMI::driveDeActivateFilter,  \
            CmpiIndicationMI::driveEnableIndications, CmpiIndicationMI::driveDisableIndications}; \
        CMPI_FACTORY_BODY(cn, pn, CMPIIndicationMI, table, (void)0)                             \
    }
