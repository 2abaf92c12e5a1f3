/*
 * The host broker's context table: the seven published entries followed by
 * one more, which releases every object the broker created for the calling
 * thread since it attached (or since the previous release). Long-running
 * provider threads call it after each cycle so their memory stays bounded.
 */
#ifndef TVX_CMPI_CONTEXT_EXT_H
#define TVX_CMPI_CONTEXT_EXT_H

#include "cmpi/cmpift.h"

#ifdef __cplusplus
extern "C" {
#endif

typedef struct _CMPIContextExtFT {
    CMPIContextFT base;
    CMPIStatus (*releaseThreadObjects)(const CMPIContext *ctx);
} CMPIContextExtFT;

#ifdef __cplusplus
}
#endif

#endif
