// Who owns what the broker hands out: objects made during a request live
// until it ends (or until released), objects made outside any request live
// in the object manager's long-lived arena.
#include "BrokerTestSupport.h"

#include <malloc.h>

#include <cstddef>

#if defined(__SANITIZE_ADDRESS__)
// The sanitizer's allocator keeps its own books; mallinfo2 does not see them.
extern "C" std::size_t __sanitizer_get_current_allocated_bytes();
#endif

namespace tvr::broker::test {
namespace {

using MemoryTest = TestProviderTest;

/// Bytes the process has allocated on the heap and not freed.
std::size_t heapInUse() {
#if defined(__SANITIZE_ADDRESS__)
  return __sanitizer_get_current_allocated_bytes();
#else
  const struct mallinfo2 info = mallinfo2();
  return info.uordblks + info.hblkhd;
#endif
}

constexpr std::size_t kMiB = 1024 * 1024;
/// TVR_Bulk makes 256 strings of 64 KiB and one 8 MiB block: 24 MiB.
constexpr std::size_t kBulk = 24 * kMiB;

/// Measures the heap whenever the provider returns a data element.
struct HeapAtEachElement : ResultObserver {
  void onItem(const ResultItem& item) override {
    if (item.kind == ResultItem::Kind::Data) heap[item.data.text] = heapInUse();
  }
  std::map<std::string, std::size_t> heap;
};

struct BulkRun {
  std::size_t before;
  std::size_t made;     ///< when the provider reported "made"
  std::size_t released; ///< when the provider reported "released"
  std::size_t after;
};

BulkRun runBulk(ObjectManager& om, const std::string& action) {
  // Load the library and make the provider before measuring.
  EXPECT_TRUE(om.enumerateInstanceNames(classPath("TVR_AllTypes")).ok());
  HeapAtEachElement observer;
  RequestOptions options;
  options.observer = &observer;
  options.keepItems = false;
  const std::size_t before = heapInUse();
  const Response r = om.getInstance(keyedPath("TVR_Bulk", {{"Action", action}}), std::nullopt, options);
  const std::size_t after = heapInUse();
  EXPECT_TRUE(r.ok()) << r.message.value_or("");
  return BulkRun{before, observer.heap["made"], observer.heap["released"], after};
}

TEST_F(MemoryTest, ObjectsMadeDuringARequestAreFreedWhenItEnds) {
  const BulkRun run = runBulk(om, "keep");
  EXPECT_GE(run.made, run.before + kBulk);
  EXPECT_GE(run.released, run.before + kBulk);
  EXPECT_LT(run.after, run.before + 2 * kMiB);
}

TEST_F(MemoryTest, ReleasedObjectsAreFreedAtOnce) {
  const BulkRun run = runBulk(om, "release");
  EXPECT_GE(run.made, run.before + kBulk);
  EXPECT_LT(run.released, run.before + 2 * kMiB);
  EXPECT_LT(run.after, run.before + 2 * kMiB);
}

TEST_F(MemoryTest, ReleaseToAMarkFreesEverythingMadeSinceAtOnce) {
  const BulkRun run = runBulk(om, "mark");
  EXPECT_GE(run.made, run.before + kBulk);
  EXPECT_LT(run.released, run.before + 2 * kMiB);
  EXPECT_LT(run.after, run.before + 2 * kMiB);
}

TEST_F(MemoryTest, RequestsLeaveNoLongLivedObjects) {
  for (const char* cls : {"TVR_AllTypes", "TVR_Sequence", "TVR_Memory", "TVR_Release", "TVR_NullProbe"})
    om.enumerateInstances(classPath(cls));
  om.getInstance(keyedPath("TVR_UpCaller", {{"Call", "enumerateInstances"}, {"Target", "TVR_AllTypes"}}));
  EXPECT_EQ(om.longLivedObjects(), 0u);
}

TEST_F(MemoryTest, ReleasingEveryKindOfObjectSucceedsOnce) {
  const std::map<std::string, CMPIrc> released = probeStatuses(om.enumerateInstances(classPath("TVR_Release")));
  const std::vector<std::string> kinds = {"instance", "path", "string", "string from property", "array",
                                          "dateTime", "args", "context clone", "enumeration"};
  ASSERT_EQ(released.size(), kinds.size());
  for (const std::string& kind : kinds) EXPECT_EQ(released.at(kind), CMPI_RC_OK) << kind;
}

TEST_F(MemoryTest, ObjectsMadeOnAHelperThreadAreLongLivedUntilReleased) {
  const Response made = om.getInstance(keyedPath("TVR_HelperThread", {{"Action", "make"}}));
  EXPECT_EQ(dataTexts(made), std::vector<std::string>{"made ok ok ok"});
  EXPECT_EQ(om.longLivedObjects(), 3u);
  const Response released = om.getInstance(keyedPath("TVR_HelperThread", {{"Action", "release"}}));
  const std::map<std::string, CMPIrc> statuses = probeStatuses(released);
  EXPECT_EQ(statuses.at("string"), CMPI_RC_OK);
  EXPECT_EQ(statuses.at("path"), CMPI_RC_OK);
  EXPECT_EQ(statuses.at("array"), CMPI_RC_OK);
  EXPECT_EQ(om.longLivedObjects(), 0u);
}

TEST_F(MemoryTest, ObjectsMadeOutsideAnyRequestAreLongLived) {
  const CMPIBroker* b = om.broker();
  CMPIString* s = CMNewString(b, "between requests", nullptr);
  CMPIObjectPath* p = CMNewObjectPath(b, "root/tvrtest", "TVR_Echo", nullptr);
  EXPECT_EQ(om.longLivedObjects(), 2u);
  // A request in between neither frees nor adds to them.
  om.enumerateInstanceNames(classPath("TVR_AllTypes"));
  EXPECT_EQ(om.longLivedObjects(), 2u);
  EXPECT_STREQ(CMGetCharsPtr(s, nullptr), "between requests");
  EXPECT_EQ(CMRelease(s).rc, CMPI_RC_OK);
  EXPECT_EQ(om.longLivedObjects(), 1u);
  EXPECT_EQ(CMRelease(p).rc, CMPI_RC_OK);
  EXPECT_EQ(om.longLivedObjects(), 0u);
}

TEST_F(MemoryTest, ObjectsLeftLongLivedAreFreedWithTheObjectManager) {
  // Nothing to assert here but the absence of a leak report: the sanitizer
  // build checks that the object manager frees what nobody released.
  CMNewString(om.broker(), "left for the object manager", nullptr);
  CMNewInstance(om.broker(), CMNewObjectPath(om.broker(), "root/tvrtest", "TVR_Echo", nullptr), nullptr);
  om.broker()->mft->cmpiMalloc(om.broker(), 1000);
  EXPECT_EQ(om.longLivedObjects(), 4u);
}

TEST_F(MemoryTest, ClonesAndTextsMadeOutsideARequestBelongToTheObjectManager) {
  const CMPIBroker* b = om.broker();
  CMPIString* s = CMNewString(b, "original", nullptr);
  CMPIDateTime* d = CMNewDateTime(b, nullptr);
  const std::size_t before = om.longLivedObjects();
  CMClone(s, nullptr);
  CMClone(d, nullptr);
  CMGetStringFormat(d, nullptr);
  EXPECT_EQ(om.longLivedObjects(), before + 3);
}

TEST_F(MemoryTest, MarkAndReleaseFreeBackToTheMark) {
  const CMPIBroker* b = om.broker();
  CMPIString* kept = CMNewString(b, "made before the mark", nullptr);
  CMPIStatus rc = {CMPI_RC_ERROR_SYSTEM, nullptr};
  CMPIGcStat* mark = b->mft->mark(b, &rc);
  EXPECT_EQ(rc.rc, CMPI_RC_OK);
  ASSERT_NE(mark, nullptr);
  CMNewString(b, "made after the mark", nullptr);
  CMNewArray(b, 3, CMPI_uint8, nullptr);
  b->mft->cmpiMalloc(b, 100);
  EXPECT_EQ(om.longLivedObjects(), 5u); // kept, the mark, and three after it
  EXPECT_EQ(b->mft->release(b, mark).rc, CMPI_RC_OK);
  EXPECT_EQ(om.longLivedObjects(), 1u);
  EXPECT_STREQ(CMGetCharsPtr(kept, nullptr), "made before the mark");
}

TEST_F(MemoryTest, ReleaseToAMarkSkipsObjectsAlreadyReleased) {
  const CMPIBroker* b = om.broker();
  CMPIGcStat* mark = b->mft->mark(b, nullptr);
  CMPIString* early = CMNewString(b, "released early", nullptr);
  CMNewString(b, "released with the mark", nullptr);
  EXPECT_EQ(CMRelease(early).rc, CMPI_RC_OK);
  EXPECT_EQ(om.longLivedObjects(), 2u);
  EXPECT_EQ(b->mft->release(b, mark).rc, CMPI_RC_OK);
  EXPECT_EQ(om.longLivedObjects(), 0u);
}

TEST_F(MemoryTest, FreeAndReallocReleaseTheirBlocks) {
  const CMPIBroker* b = om.broker();
  void* block = b->mft->cmpiMalloc(b, 16);
  void* grown = b->mft->cmpiRealloc(b, block, 4096);
  EXPECT_EQ(om.longLivedObjects(), 1u);
  b->mft->cmpiFree(b, grown);
  EXPECT_EQ(om.longLivedObjects(), 0u);
  b->mft->cmpiFree(b, nullptr);
}

TEST_F(MemoryTest, ReallocOfNullIsMalloc) {
  const CMPIBroker* b = om.broker();
  void* block = b->mft->cmpiRealloc(b, nullptr, 32);
  ASSERT_NE(block, nullptr);
  EXPECT_EQ(om.longLivedObjects(), 1u);
}

TEST_F(MemoryTest, CallocRefusesAnOverflowingSize) {
  const CMPIBroker* b = om.broker();
  EXPECT_EQ(b->mft->cmpiCalloc(b, static_cast<size_t>(-1) / 2, 4), nullptr);
  EXPECT_EQ(om.longLivedObjects(), 0u);
}

TEST_F(MemoryTest, MemoryServicesRefuseAForeignBroker) {
  const CMPIBroker* b = om.broker();
  EXPECT_EQ(b->mft->cmpiMalloc(nullptr, 16), nullptr);
  EXPECT_EQ(b->mft->cmpiStrDup(nullptr, "x"), nullptr);
  CMPIStatus rc = {CMPI_RC_OK, nullptr};
  EXPECT_EQ(b->mft->mark(nullptr, &rc), nullptr);
  EXPECT_EQ(rc.rc, CMPI_RC_ERR_INVALID_HANDLE);
  EXPECT_EQ(b->mft->release(nullptr, nullptr).rc, CMPI_RC_ERR_INVALID_HANDLE);
  EXPECT_EQ(om.longLivedObjects(), 0u);
}

} // namespace
} // namespace tvr::broker::test
