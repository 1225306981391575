#pragma once

#include <functional>
#include <string>

#include "gantry/lib/GantryException.h"

// The text of the GantryException that call throws, or "" when it throws none.
inline std::string FailureOf(const std::function<void()>& call) {
    try {
        call();
    } catch (const Gantry::Lib::GantryException& e) {
        return e.GetMessage(0);
    }
    return "";
}
