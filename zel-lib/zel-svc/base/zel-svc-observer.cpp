#include "base/zel-svc-observer.h"

namespace {

ZelSvcObserver gNobody;
ZelSvcObserver *gpObserver = nullptr;

} // namespace

ZelSvcObserver *zel_svc_set_observer(ZelSvcObserver *observer) {
    ZelSvcObserver *before = gpObserver;
    gpObserver = observer;
    return before;
}

ZelSvcObserver &zel_svc_observer() { return gpObserver ? *gpObserver : gNobody; }

bool zel_svc_is_observed() { return gpObserver != nullptr; }
