// The program's own operator new and delete (the plain, array and nothrow
// forms, so every pair stays matched under the sanitizer), backed by malloc.
#include "FailingAllocation.h"

#include <cstdlib>
#include <new>

namespace {

size_t g_failingSize = 0;
bool g_failed = false;

void* allocate(size_t size)
{
	if (g_failingSize != 0 && size == g_failingSize) {
		g_failingSize = 0;
		g_failed = true;
		return nullptr;
	}
	return malloc(size ? size : 1);
}

} // namespace

namespace ct::test {

void failNextAllocationOf(size_t size)
{
	g_failingSize = size;
	g_failed = false;
}

bool allocationFailed()
{
	return g_failed;
}

} // namespace ct::test

void* operator new(size_t size)
{
	if (void* p = allocate(size))
		return p;
	throw std::bad_alloc();
}

void* operator new[](size_t size)
{
	return operator new(size);
}

void* operator new(size_t size, const std::nothrow_t&) noexcept
{
	return allocate(size);
}

void* operator new[](size_t size, const std::nothrow_t&) noexcept
{
	return allocate(size);
}

void operator delete(void* p) noexcept
{
	free(p);
}

void operator delete[](void* p) noexcept
{
	free(p);
}

void operator delete(void* p, size_t) noexcept
{
	free(p);
}

void operator delete[](void* p, size_t) noexcept
{
	free(p);
}

void operator delete(void* p, const std::nothrow_t&) noexcept
{
	free(p);
}

void operator delete[](void* p, const std::nothrow_t&) noexcept
{
	free(p);
}
