#pragma once
// System calls that fail when told to. Linked ahead of the C library, the functions of this unit
// are what every other part of the program calls.
#include <functional>
#include <string>
#include <vector>

namespace FaultyCalls {

enum class Fault { None, Error, Short, Kill };

struct Plan {
    bool noLinks = false;
    std::size_t number = 0;  // which of the calls, from 1
    Fault fault = Fault::None;
    int error = 0;  // errno for Fault::Error
};

/// Carries out the plan while `work` runs; returns the names of the functions that were called.
std::vector<std::string> During(const Plan& plan, const std::function<void()>& work);

}  // namespace FaultyCalls
