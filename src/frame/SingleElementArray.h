// Several CIM properties are arrays that always hold exactly one element.
#pragma once

#include "CmpiArray.h"

namespace frame {

inline CmpiArray singleElementArray(CMPIType type, const CmpiData &value) {
    CmpiArray array(1, type);
    array[0] = value;
    return array;
}

}  // namespace frame
