// Counts heap allocations made through operator new in the test executable
// (the counting operator new is defined in AllocationCounter.cpp and also
// serves the libraries loaded into it).

#ifndef TVR_TESTS_KVLOG_ALLOCATIONCOUNTER_H
#define TVR_TESTS_KVLOG_ALLOCATIONCOUNTER_H

namespace kvlogtest {

/// Number of operator new calls since the process started, on all threads.
long allocationCount();

} // namespace kvlogtest

#endif // TVR_TESTS_KVLOG_ALLOCATIONCOUNTER_H
