/* Everything a plug-in may use of the host's utility services. */
#ifndef HOSTUTIL_HOSTUTILITIES_H
#define HOSTUTIL_HOSTUTILITIES_H

#include "hostutil/HostCompare.h"
#include "hostutil/HostFile.h"
#include "hostutil/HostMatrix.h"
#include "hostutil/HostNumbers.h"
#include "hostutil/HostReport.h"
#include "hostutil/HostStrings.h"
#include "hostutil/RecordList.h"
#include "hostutil/UTF16String.h"

#endif
