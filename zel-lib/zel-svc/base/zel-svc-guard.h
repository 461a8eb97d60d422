#pragma once
// Where memory runs out, the smallest unit that the run can go on without is given up: one pass, one phase.
// The functions of the interface are the last net, so that no caller in C ever meets an exception.
//
//     zel_svc_guarded([&] { __zel_svc_config_copy_dir(from, to); });
//     return zel_svc_guarded_or(0, [&] { return find_customer(name); });

#include <exception>

template <class Work> void zel_svc_guarded(Work &&work) {
    try {
        work();
    } catch (const std::exception &) {
    }
}

template <class Result, class Work> Result zel_svc_guarded_or(Result failed, Work &&work) {
    try {
        return work();
    } catch (const std::exception &) {
        return failed;
    }
}
