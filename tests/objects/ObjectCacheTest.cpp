// The object cache: loading, lookups, merging and saving.
#include <gtest/gtest.h>

#include "objects/ObjectCache.h"
#include "platform/FileFaults.h"
#include "tests/support/TempFolder.h"

namespace {

class ObjectCacheTest : public testing::Test {
protected:
    CString File() const { return m_folder.Path("KalmoretObj.Cache").c_str(); }

    CTempFolder m_folder;
    CObjectCache m_cache;
};

TEST_F(ObjectCacheTest, DuplicateIdsAreKeptAndTheFirstIsUsed) {
    m_folder.Write("KalmoretObj.Cache", "A=first\r\nB=b\r\nA=second\r\n");
    m_cache.LoadObjectCacheFile(File());
    EXPECT_EQ(m_cache.FindCacheIndex("A"), 0);
    EXPECT_EQ(m_cache.FindCacheIndex("B"), 1);
    EXPECT_EQ(m_cache.FindCacheIndex("a"), -1);
    CString strFile("untouched");
    EXPECT_FALSE(m_cache.LookupObjectCache("A ", strFile));
    EXPECT_STREQ(strFile, "untouched");
    EXPECT_TRUE(m_cache.LookupObjectCache("A", strFile));
    EXPECT_STREQ(strFile, "first");

    m_cache.MergeObjectCache({{"A", "new"}, {"C", "c"}, {"B", ""}, {"D", ""}});
    m_cache.SaveObjectCacheFile(File());
    // A merge updates the first entry, appends new IDs, and never empties or drops an entry.
    EXPECT_EQ(m_folder.Read("KalmoretObj.Cache"), "A=new\r\nB=b\r\nA=second\r\nC=c\r\n");
}

TEST_F(ObjectCacheTest, LoadingReplacesTheCacheAndAMissingFileEmptiesIt) {
    m_cache.MergeObjectCache({{"Z", "z"}});
    m_folder.Write("KalmoretObj.Cache", "\r\n  A = a  \r\nbad\r\n");
    m_cache.LoadObjectCacheFile(File());
    ASSERT_EQ(m_cache.GetObjectCache().size(), 1u);
    EXPECT_STREQ(m_cache.GetObjectCache()[0].m_strObjectId, "A ");
    // Saving again drops the blank and malformed lines and the trimmed white space.
    m_cache.SaveObjectCacheFile(File());
    EXPECT_EQ(m_folder.Read("KalmoretObj.Cache"), "A = a\r\n");
    m_cache.LoadObjectCacheFile(m_folder.Path("none.Cache").c_str());
    EXPECT_TRUE(m_cache.GetObjectCache().empty());
    CString strFile;
    EXPECT_FALSE(m_cache.LookupObjectCache("A", strFile));
}

TEST_F(ObjectCacheTest, AFileThatCouldNotBeReadIsNotOverwritten) {
    m_folder.Write("KalmoretObj.Cache", "A=a\r\nB=b\r\n");
    StandInSetFileFault(File(), STANDIN_FAULT_READ, ERROR_SHARING_VIOLATION);
    m_cache.LoadObjectCacheFile(File());
    StandInSetFileFault(nullptr, 0, 0);
    m_cache.MergeObjectCache({{"C", "c"}});
    m_cache.SaveObjectCacheFile(File());
    EXPECT_EQ(m_folder.Read("KalmoretObj.Cache"), "A=a\r\nB=b\r\n");
    // Once it reads again, saving works again.
    m_cache.LoadObjectCacheFile(File());
    m_cache.MergeObjectCache({{"C", "c"}});
    m_cache.SaveObjectCacheFile(File());
    EXPECT_EQ(m_folder.Read("KalmoretObj.Cache"), "A=a\r\nB=b\r\nC=c\r\n");
}

TEST_F(ObjectCacheTest, AnExecutableThatIsNoHostHasNoCacheFile) {
    m_cache.MergeObjectCache({{"A", "a"}});
    m_cache.SaveObjectCache();  // this test program is not called Osrik.exe: nothing is written
    m_cache.LoadObjectCache();
    EXPECT_TRUE(m_cache.GetObjectCache().empty());
}

}  // namespace
