#include "zoncore/SmallBlockAllocator.h"

#include "zoncore/Mutex.h"

#include <array>
#include <cstdint>
#include <mutex>

// Blocks of one size are kept in lists. Each thread has a list a size, which it takes from and gives to without a lock;
// between threads blocks travel in batches over a depot under a mutex. Nothing here has a destructor that ends the life of
// a list: static objects of any library may dispose of their blocks in any order.

namespace zoncore::utility
{
namespace
{

#if ZONCORE_SMALL_BLOCK_POOL

// What compilers of this family understand.
	#if defined(__GNUC__)
		#define ZONCORE_NOINLINE [[gnu::noinline]]
	#else
		#define ZONCORE_NOINLINE
	#endif

// Initial-exec: one instruction instead of a call on every access. The cache fits the room that the system keeps for
// libraries that are loaded late.
	#if defined(__ELF__)
		#define ZONCORE_TLS_MODEL [[gnu::tls_model("initial-exec")]]
	#else
		#define ZONCORE_TLS_MODEL
	#endif

// g++ for Windows takes the plain variables of a thread away before the thread's other destructors run, which may still
// dispose of blocks: there every block comes from the depot.
	#if defined(__MINGW32__) && !defined(__clang__)
		#define ZONCORE_THREAD_CACHES 0
	#else
		#define ZONCORE_THREAD_CACHES 1
	#endif

constexpr std::size_t kGranule = 16;   // the alignment of any scalar type, everywhere
static_assert(kGranule % alignof(std::max_align_t) == 0);
constexpr std::size_t kSizeClasses = 16;
constexpr std::size_t kLargestPooled = kGranule * kSizeClasses;
constexpr std::size_t kBatch = 32;               // blocks that travel between a thread and the depot at once
constexpr std::size_t kMostKept = 4 * kBatch;    // blocks of one size that a thread keeps for itself
constexpr std::size_t kChunkBytes = 64 * 1024;   // what the depot asks the system for

struct Block
{
	Block* mNext;
};

struct BlockList
{
	Block* mFirst;
	std::size_t mCount;

	void Push(void* inBlock)
	{
		mFirst = new (inBlock) Block{mFirst};
		++mCount;
	}

	void* Pop()
	{
		Block* const block = mFirst;
		mFirst = block->mNext;
		--mCount;
		return block;
	}
};

constexpr std::size_t SizeClass(std::size_t inSize)
{
	return inSize == 0 ? 0 : (inSize - 1) / kGranule;
}

constexpr std::size_t ClassBytes(std::size_t inClass)
{
	return (inClass + 1) * kGranule;
}

// The blocks of one size that no thread holds.
class Depot
{
public:
	// Moves up to inCount blocks to ioList, and at least one; throws std::bad_alloc when there is none to be had.
	void Take(BlockList& ioList, std::size_t inCount, std::size_t inBytes)
	{
		const std::lock_guard lock(mMutex);
		for (std::size_t moved = 0; moved < inCount; ++moved)
		{
			if (mFree.mFirst == nullptr && moved != 0 && mChunkLeft < inBytes)
				return;
			ioList.Push(mFree.mFirst != nullptr ? mFree.Pop() : Carve(inBytes));
		}
	}

	void Give(BlockList& ioList, std::size_t inCount)
	{
		const std::lock_guard lock(mMutex);
		for (std::size_t moved = 0; moved < inCount; ++moved)
			mFree.Push(ioList.Pop());
	}

private:
	void* Carve(std::size_t inBytes)
	{
		if (mChunkLeft < inBytes)
		{
			mChunk = static_cast<std::byte*>(::operator new(kChunkBytes));
			mChunkLeft = kChunkBytes;
		}
		mChunkLeft -= inBytes;
		return mChunk + mChunkLeft;
	}

	threads::Mutex mMutex;
	BlockList mFree{};
	std::byte* mChunk = nullptr;
	std::size_t mChunkLeft = 0;
};

// Depots outlive every static object, so they are never destroyed.
union Depots
{
	constexpr Depots() : mDepots() {}
	~Depots() {}

	std::array<Depot, kSizeClasses> mDepots;
};
constinit Depots sDepots;

	#if ZONCORE_THREAD_CACHES

enum class CacheState : std::uint8_t
{
	Unused,   // the thread has not disposed of anything yet: its end is not watched
	Open,
	Closed   // the thread is ending: its blocks go to the depot one by one
};

struct ThreadCache
{
	std::array<BlockList, kSizeClasses> mLists;
	CacheState mState;
};

ZONCORE_TLS_MODEL constinit thread_local ThreadCache sCache{};

struct CacheCloser
{
	~CacheCloser()
	{
		for (std::size_t sizeClass = 0; sizeClass < kSizeClasses; ++sizeClass)
			sDepots.mDepots[sizeClass].Give(sCache.mLists[sizeClass], sCache.mLists[sizeClass].mCount);
		sCache.mState = CacheState::Closed;
	}
};

void WatchThreadEnd()
{
	thread_local CacheCloser sCloser;
	static_cast<void>(sCloser);
	sCache.mState = CacheState::Open;
}

ZONCORE_NOINLINE void* AllocateFromDepot(std::size_t inClass)
{
	if (sCache.mState == CacheState::Unused)
		WatchThreadEnd();
	BlockList& list = sCache.mLists[inClass];
	sDepots.mDepots[inClass].Take(list, sCache.mState == CacheState::Open ? kBatch : 1, ClassBytes(inClass));
	return list.Pop();
}

ZONCORE_NOINLINE void DisposeSlowly(void* inBlock, std::size_t inClass)
{
	if (sCache.mState == CacheState::Unused)
		WatchThreadEnd();
	BlockList& list = sCache.mLists[inClass];
	list.Push(inBlock);
	if (sCache.mState == CacheState::Closed)
		sDepots.mDepots[inClass].Give(list, list.mCount);
	else if (list.mCount > kMostKept)
		sDepots.mDepots[inClass].Give(list, kBatch);
}

	#endif   // ZONCORE_THREAD_CACHES

#endif   // ZONCORE_SMALL_BLOCK_POOL

}   // namespace

#if ZONCORE_SMALL_BLOCK_POOL

void* SmallBlockAllocator::Allocate(std::size_t inSize)
{
	if (inSize > kLargestPooled)
		return ::operator new(inSize);
	const std::size_t sizeClass = SizeClass(inSize);
	#if ZONCORE_THREAD_CACHES
	BlockList& list = sCache.mLists[sizeClass];
	return list.mFirst != nullptr ? list.Pop() : AllocateFromDepot(sizeClass);
	#else
	BlockList list{};
	sDepots.mDepots[sizeClass].Take(list, 1, ClassBytes(sizeClass));
	return list.Pop();
	#endif
}

void SmallBlockAllocator::Dispose(void* inBlock, std::size_t inSize) noexcept
{
	if (inBlock == nullptr)
		return;
	if (inSize > kLargestPooled)
		return ::operator delete(inBlock);
	const std::size_t sizeClass = SizeClass(inSize);
	#if ZONCORE_THREAD_CACHES
	BlockList& list = sCache.mLists[sizeClass];
	if (sCache.mState != CacheState::Open || list.mCount >= kMostKept)
		return DisposeSlowly(inBlock, sizeClass);
	list.Push(inBlock);
	#else
	BlockList list{};
	list.Push(inBlock);
	sDepots.mDepots[sizeClass].Give(list, 1);
	#endif
}

#else

void* SmallBlockAllocator::Allocate(std::size_t inSize)
{
	return ::operator new(inSize);
}

void SmallBlockAllocator::Dispose(void* inBlock, [[maybe_unused]] std::size_t inSize) noexcept
{
	#if __cpp_sized_deallocation
	::operator delete(inBlock, inSize);   // a checking one finds blocks that come back with another size
	#else
	::operator delete(inBlock);
	#endif
}

#endif   // ZONCORE_SMALL_BLOCK_POOL

}   // namespace zoncore::utility
