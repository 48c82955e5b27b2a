#include "SqliteFaultInjector.h"

#include <sqlite3.h>

#include <atomic>
#include <cstring>
#include <mutex>

namespace ct::db {

namespace {

constexpr const char* kVfsName = "ct-fault";

std::atomic<int> g_failFrom{0};
std::atomic<int> g_writes{0};

sqlite3_vfs g_vfs;
sqlite3_io_methods g_methods;
sqlite3_vfs* g_real = nullptr;

struct FaultFile {
	sqlite3_file base;
	sqlite3_file* real;
};

sqlite3_file* realOf(sqlite3_file* f)
{
	return reinterpret_cast<FaultFile*>(f)->real;
}

bool shouldFail()
{
	int n = ++g_writes;
	int from = g_failFrom.load();
	return from > 0 && n >= from;
}

int xClose(sqlite3_file* f)
{
	sqlite3_file* real = realOf(f);
	return real->pMethods ? real->pMethods->xClose(real) : SQLITE_OK;
}

int xRead(sqlite3_file* f, void* buf, int amt, sqlite3_int64 off)
{
	return realOf(f)->pMethods->xRead(realOf(f), buf, amt, off);
}

int xWrite(sqlite3_file* f, const void* buf, int amt, sqlite3_int64 off)
{
	if (shouldFail())
		return SQLITE_FULL;
	return realOf(f)->pMethods->xWrite(realOf(f), buf, amt, off);
}

int xTruncate(sqlite3_file* f, sqlite3_int64 size)
{
	return realOf(f)->pMethods->xTruncate(realOf(f), size);
}

int xSync(sqlite3_file* f, int flags)
{
	if (g_failFrom.load() > 0 && g_writes.load() >= g_failFrom.load())
		return SQLITE_FULL;
	return realOf(f)->pMethods->xSync(realOf(f), flags);
}

int xFileSize(sqlite3_file* f, sqlite3_int64* size)
{
	return realOf(f)->pMethods->xFileSize(realOf(f), size);
}

int xLock(sqlite3_file* f, int lock)
{
	return realOf(f)->pMethods->xLock(realOf(f), lock);
}

int xUnlock(sqlite3_file* f, int lock)
{
	return realOf(f)->pMethods->xUnlock(realOf(f), lock);
}

int xCheckReservedLock(sqlite3_file* f, int* out)
{
	return realOf(f)->pMethods->xCheckReservedLock(realOf(f), out);
}

int xFileControl(sqlite3_file* f, int op, void* arg)
{
	return realOf(f)->pMethods->xFileControl(realOf(f), op, arg);
}

int xSectorSize(sqlite3_file* f)
{
	return realOf(f)->pMethods->xSectorSize(realOf(f));
}

int xDeviceCharacteristics(sqlite3_file* f)
{
	return realOf(f)->pMethods->xDeviceCharacteristics(realOf(f));
}

int xShmMap(sqlite3_file* f, int page, int size, int extend, void volatile** out)
{
	return realOf(f)->pMethods->xShmMap(realOf(f), page, size, extend, out);
}

int xShmLock(sqlite3_file* f, int offset, int n, int flags)
{
	return realOf(f)->pMethods->xShmLock(realOf(f), offset, n, flags);
}

void xShmBarrier(sqlite3_file* f)
{
	realOf(f)->pMethods->xShmBarrier(realOf(f));
}

int xShmUnmap(sqlite3_file* f, int deleteFlag)
{
	return realOf(f)->pMethods->xShmUnmap(realOf(f), deleteFlag);
}

int xFetch(sqlite3_file* f, sqlite3_int64 off, int amt, void** pp)
{
	return realOf(f)->pMethods->xFetch(realOf(f), off, amt, pp);
}

int xUnfetch(sqlite3_file* f, sqlite3_int64 off, void* p)
{
	return realOf(f)->pMethods->xUnfetch(realOf(f), off, p);
}

int xOpen(sqlite3_vfs*, const char* name, sqlite3_file* file, int flags, int* outFlags)
{
	auto* ff = reinterpret_cast<FaultFile*>(file);
	ff->real = reinterpret_cast<sqlite3_file*>(ff + 1);
	ff->base.pMethods = nullptr;
	int rc = g_real->xOpen(g_real, name, ff->real, flags, outFlags);
	if (rc == SQLITE_OK || ff->real->pMethods)
		ff->base.pMethods = &g_methods;
	return rc;
}

void registerVfs()
{
	g_real = sqlite3_vfs_find(nullptr);
	g_vfs = *g_real;
	g_vfs.zName = kVfsName;
	g_vfs.szOsFile = (int)sizeof(FaultFile) + g_real->szOsFile;
	g_vfs.xOpen = xOpen;
	g_vfs.pNext = nullptr;

	memset(&g_methods, 0, sizeof(g_methods));
	g_methods.iVersion = 3;
	g_methods.xClose = xClose;
	g_methods.xRead = xRead;
	g_methods.xWrite = xWrite;
	g_methods.xTruncate = xTruncate;
	g_methods.xSync = xSync;
	g_methods.xFileSize = xFileSize;
	g_methods.xLock = xLock;
	g_methods.xUnlock = xUnlock;
	g_methods.xCheckReservedLock = xCheckReservedLock;
	g_methods.xFileControl = xFileControl;
	g_methods.xSectorSize = xSectorSize;
	g_methods.xDeviceCharacteristics = xDeviceCharacteristics;
	g_methods.xShmMap = xShmMap;
	g_methods.xShmLock = xShmLock;
	g_methods.xShmBarrier = xShmBarrier;
	g_methods.xShmUnmap = xShmUnmap;
	g_methods.xFetch = xFetch;
	g_methods.xUnfetch = xUnfetch;

	sqlite3_vfs_register(&g_vfs, 0);
}

} // namespace

const char* FaultInjector::vfsName()
{
	static std::once_flag once;
	std::call_once(once, registerVfs);
	return kVfsName;
}

void FaultInjector::failWritesFrom(int n)
{
	vfsName();
	g_writes = 0;
	g_failFrom = n < 1 ? 1 : n;
}

void FaultInjector::disarm()
{
	g_failFrom = 0;
	g_writes = 0;
}

int FaultInjector::writeCount()
{
	return g_writes.load();
}

void FaultInjector::resetCount()
{
	g_writes = 0;
}

} // namespace ct::db
