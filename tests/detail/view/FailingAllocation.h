// Allocation failure on demand for this test program: the next allocation
// of one exact size throws std::bad_alloc, as a full memory would.
#pragma once

#include <cstddef>

namespace ct::test {

// Arms the failure; it fires once. A size of 0 disarms it.
void failNextAllocationOf(size_t size);
// Whether the armed failure fired since it was armed.
bool allocationFailed();

} // namespace ct::test
