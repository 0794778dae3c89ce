#pragma once
// System calls that fail when told to. Linked ahead of the C library, the functions of this unit
// are what every other part of the program calls.
#include <functional>
#include <map>
#include <string>

namespace FaultyCalls {

enum class Fault { None, Error, Short, Kill };

struct Plan {
    Fault fault = Fault::None;
    std::string call;  // the function's name
    int number = 0;    // which of its calls, from 1
    int error = 0;     // errno for Fault::Error
    bool noLinks = false;
};

/// Carries out the plan while `work` runs; returns how often each function was called.
std::map<std::string, int> During(const Plan& plan, const std::function<void()>& work);

}  // namespace FaultyCalls
