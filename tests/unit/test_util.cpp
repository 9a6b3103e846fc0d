// Reference counting, counters, byte streams and message checkpoints.
#include <gtest/gtest.h>

#include "tests/support/capturesink.h"
#include "tests/support/testfiles.h"
#include "util/tn_counter.h"
#include "util/tn_istream.h"
#include "util/tn_message.h"
#include "util/tn_messagecheckpoint.h"
#include "util/tn_ostream.h"

namespace {

// Counts its live instances so tests see exactly when deletion happens.
class Tracked : public Tn::RCObject {
public:
    explicit Tracked(int* live) : live_(live) { ++*live_; }
    ~Tracked() override { --*live_; }

private:
    int* live_;
};

typedef std::vector<std::vector<int32_t>> Positions;

// Every position a counter takes, starting with the current one, until it wraps.
Positions walk(Tn_Counter& c) {
    Positions r{c.values()};
    while (c.next()) r.push_back(c.values());
    return r;
}

}  // namespace

TEST(RCPtr, CopiesShareAndTheLastOneDeletes) {
    int live = 0;
    {
        Tn::RCPtr<Tracked> a(new Tracked(&live));
        EXPECT_EQ(a->refCount(), 1u);
        {
            Tn::RCPtr<Tracked> b(a);
            Tn::RCPtr<Tracked> c;
            c = b;
            EXPECT_EQ(a->refCount(), 3u);
            EXPECT_TRUE(a == b);
            EXPECT_TRUE(a == b.get() && b.get() == a);
        }
        EXPECT_EQ(live, 1);
        EXPECT_EQ(a->refCount(), 1u);
        a = a;  // self-assignment keeps the object
        EXPECT_EQ(live, 1);
        EXPECT_EQ(a->refCount(), 1u);
    }
    EXPECT_EQ(live, 0);
}

TEST(RCPtr, AssignmentReleasesTheOldPointeeAndNullBehaves) {
    int live = 0;
    Tn::RCPtr<Tracked> a(new Tracked(&live));
    Tn::RCPtr<Tracked> b(new Tracked(&live));
    EXPECT_EQ(live, 2);
    a = b;
    EXPECT_EQ(live, 1);
    Tn::RCPtr<Tracked> n;
    EXPECT_TRUE(!n);
    EXPECT_FALSE(n);
    EXPECT_TRUE(n == nullptr && nullptr == n);
    const Tracked* raw = nullptr;
    EXPECT_TRUE(n == raw && raw == n);
    EXPECT_TRUE(a != raw && raw != a);
    EXPECT_TRUE(a ? true : false);
    a = n;
    b = nullptr;
    EXPECT_EQ(live, 0);
}

TEST(Counter, UpAndDownCountersWrapWithFalse) {
    Tn_CounterPtr up = Tn_Counter::create(3, 5);
    EXPECT_EQ(walk(*up), (Positions{{3}, {4}, {5}}));
    EXPECT_EQ(up->values(), std::vector<int32_t>{3});  // wrapped back
    Tn_CounterPtr down = Tn_Counter::create(5, 3);
    EXPECT_EQ(walk(*down), (Positions{{5}, {4}, {3}}));
    EXPECT_EQ(down->values(), std::vector<int32_t>{5});
    Tn_CounterPtr one = Tn_Counter::create(7, 7);
    EXPECT_FALSE(one->next());
    EXPECT_FALSE(one->next());
    EXPECT_EQ(one->values(), std::vector<int32_t>{7});
    // Extreme bounds never overflow.
    Tn_CounterPtr top = Tn_Counter::create(INT32_MAX - 1, INT32_MAX);
    EXPECT_EQ(walk(*top), (Positions{{INT32_MAX - 1}, {INT32_MAX}}));
    Tn_CounterPtr bottom = Tn_Counter::create(INT32_MIN + 1, INT32_MIN);
    EXPECT_EQ(walk(*bottom), (Positions{{INT32_MIN + 1}, {INT32_MIN}}));
}

TEST(Counter, PairCountersFormAnOdometer) {
    Tn_CounterPtr pair = Tn_Counter::createPair(Tn_Counter::create(0, 1), Tn_Counter::create(0, 2));
    EXPECT_EQ(walk(*pair), (Positions{{0, 0}, {0, 1}, {0, 2}, {1, 0}, {1, 1}, {1, 2}}));
    EXPECT_EQ(pair->values(), (std::vector<int32_t>{0, 0}));
    // Three dimensions by nesting; the inner one counts down.
    Tn_CounterPtr three = Tn_Counter::createPair(
        Tn_Counter::create(1, 0), Tn_Counter::createPair(Tn_Counter::create(0, 1), Tn_Counter::create(1, 0)));
    Positions p = walk(*three);
    ASSERT_EQ(p.size(), 8u);
    EXPECT_EQ(p.front(), (std::vector<int32_t>{1, 0, 1}));
    EXPECT_EQ(p[1], (std::vector<int32_t>{1, 0, 0}));
    EXPECT_EQ(p.back(), (std::vector<int32_t>{0, 1, 0}));
}

TEST(Stream, StringInputDeliversInPiecesAndReportsTheEnd) {
    Tn_IStringStream in(Port_String("abc"));
    char buf[4] = {};
    EXPECT_FALSE(in.eof());
    EXPECT_EQ(in.read(buf, 2), 2u);
    EXPECT_EQ(std::string(buf, 2), "ab");
    EXPECT_FALSE(in.eof());
    EXPECT_EQ(in.read(buf, 2), 1u);
    EXPECT_EQ(buf[0], 'c');
    EXPECT_EQ(in.gcount(), 1u);
    EXPECT_TRUE(in.eof());
    EXPECT_EQ(in.read(buf, 2), 0u);
    EXPECT_EQ(in.gcount(), 0u);
    EXPECT_EQ(in.read(buf, 0), 0u);
    Tn_IStringStream empty(Port_String(""));
    EXPECT_TRUE(empty.eof());
}

TEST(Stream, FileStreamsRoundTrip) {
    TempDir dir;
    const std::string path = dir / "f.bin";
    {
        Tn_OFileStream out(path.c_str());
        ASSERT_TRUE(out.isOpen());
        out.write("ab", 2);
        out.write("cd");
        out.write(int32_t(-3));
        out.write(int16_t(12));
        out.write('!');
    }
    Tn_IFileStream in(path.c_str());
    ASSERT_TRUE(in.isOpen());
    char buf[64];
    const size_t n = in.read(buf, sizeof buf);
    EXPECT_EQ(std::string(buf, n), "abcd-312!");
    EXPECT_TRUE(in.eof());
    Tn_IFileStream missing((dir / "none").c_str());
    EXPECT_FALSE(missing.isOpen());
    EXPECT_TRUE(missing.eof());
    EXPECT_EQ(missing.read(buf, 4), 0u);

    Tn_OStringStream s;
    s.write("x=");
    s.write(int32_t(-2147483647 - 1));
    s.write(',');
    s.write(int16_t(-7));
    s.write("yz", 1);
    EXPECT_EQ(s.str().str(), "x=-2147483648,-7y");
}

TEST(MessageCheckpoint, CountsOnlyWhatCameAfterIt) {
    CaptureSink sink;
    TN_MSG().issueError("first\n");
    TN_MSG().issueError("second\n");
    Tn_MessageCheckpoint cp;
    EXPECT_FALSE(cp.errorsIssued());
    EXPECT_EQ(cp.errorCount(), 0);
    TN_MSG().issueWarning("w\n");
    EXPECT_FALSE(cp.errorsIssued());
    EXPECT_TRUE(cp.warningsIssued());
    TN_MSG().issueError("third\n");
    EXPECT_TRUE(cp.errorsIssued());
    EXPECT_EQ(cp.errorCount(), 1);
    EXPECT_EQ(cp.warningCount(), 1);
    cp.reset();
    EXPECT_FALSE(cp.errorsIssued());
    EXPECT_FALSE(cp.warningsIssued());
}
