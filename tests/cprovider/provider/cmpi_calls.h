/*
 * The CMPI calls of this provider in the short form C providers use: each
 * is obj->ft->fn(obj, ...). A CMPI_chars value is the C string itself; any
 * other type passes the address of a CMPIValue.
 */
#ifndef TVX_CPROVIDER_CMPI_CALLS_H
#define TVX_CPROVIDER_CMPI_CALLS_H

#include "cmpi/cmpift.h"

#define CP_SET_PROPERTY(inst, name, value, type) \
    ((inst)->ft->setProperty((inst), (name), (const CMPIValue *)(value), (type)))
#define CP_ADD_KEY(op, name, value, type) \
    ((op)->ft->addKey((op), (name), (const CMPIValue *)(value), (type)))
#define CP_SET_ELEMENT(array, index, value, type) \
    ((array)->ft->setElementAt((array), (index), (const CMPIValue *)(value), (type)))
#define CP_GET_KEY(op, name) ((op)->ft->getKey((op), (name), NULL))
#define CP_CHARS(string) ((string)->ft->getCharPtr((string), NULL))

#define CP_RETURN_INSTANCE(rslt, inst) ((rslt)->ft->returnInstance((rslt), (inst)))
#define CP_RETURN_PATH(rslt, op) ((rslt)->ft->returnObjectPath((rslt), (op)))
#define CP_RETURN_DONE(rslt) ((rslt)->ft->returnDone(rslt))

#endif
