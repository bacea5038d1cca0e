// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/plugin/PluginLogSink.h"

#include <gtest/gtest.h>

#include <new>

#include "tests/support/fakes/FakeLock.h"
#include "tests/support/fakes/RecordingLogger.h"

namespace {

int loggersMade = 0;

class CountingLogger : public slog::CLoggerBaseEx {
public:
    CountingLogger() { ++loggersMade; }
    void BeginRecord(ncfUInt32, const char*) override {
        if (journal) {
            journal->add("begin");
        }
    }
    void Hook() override {}
    void SetFlag(ncfUInt32) override {}
    void WriteDouble(double) override {}
    void WriteSInt64(ncfSInt64) override {}
    void WriteUInt64(ncfUInt64) override {}
    void WriteUInt32(ncfUInt32) override {}
    void WriteSInt32(ncfSInt32) override {}
    void WriteString(const char*) override {}
    void Manipulate(std::ios_base& (*)(std::ios_base&)) override {}
    void EndRecord() override {}

    static inline Journal* journal = nullptr;
};

class Sink : public ::testing::Test {
protected:
    Sink() {
        loggersMade = 0;
        CountingLogger::journal = &journal;
        sink.SetLoggerMaker([]() -> slog::CLoggerBaseEx* { return new CountingLogger; });
        host.name(CompID_LockComponent, "lock component");
        host.maker(CompID_LockComponent, [this](const GUID&, void** out) {
            *out = static_cast<INCFLock*>(new FakeLock(&journal));
            return NCF_OK;
        });
    }
    ~Sink() override {
        sink.Stop();
        sink.SetLoggerMaker(nullptr);
        CountingLogger::journal = nullptr;
        EXPECT_EQ(LiveFakes(), 2) << "the lock was given back; host and console are left";
    }

    Journal journal;
    FakeHost host{&journal};
    PluginLogSink& sink = PluginLogSink::Instance();
};

TEST_F(Sink, DiscardsBeforeItIsStartedAndTouchesNoHostObject) {
    slog::CLoggerBaseEx& chosen = sink.Begin(1, "Somewhere", slog::kError);
    EXPECT_NE(dynamic_cast<slog::CNullLoggerEx*>(&chosen), nullptr);
    EXPECT_EQ(&sink.CurrentLogger(), &chosen);
    EXPECT_TRUE(journal.lines().empty());
    EXPECT_EQ(loggersMade, 0);
}

TEST_F(Sink, HoldsItsLockForTheStartOfARecordOnly) {
    sink.Start(host.factory());
    journal.clear();
    sink.Begin(1, "Somewhere", slog::kInformation);
    EXPECT_EQ(journal.lines(), (std::vector<std::string>{"lock", "begin", "unlock"}));
}

TEST_F(Sink, MakesItsMainLoggerOnce) {
    sink.Start(host.factory());
    sink.Begin(1, "Somewhere", slog::kInformation);
    sink.Begin(1, "Somewhere", slog::kWarning);
    EXPECT_EQ(loggersMade, 1);
}

TEST_F(Sink, DiscardsAMaskWithoutACommonBit) {
    sink.Start(host.factory());
    journal.clear();
    slog::CLoggerBaseEx& chosen = sink.Begin(2, "Somewhere", slog::kError);
    EXPECT_NE(dynamic_cast<slog::CNullLoggerEx*>(&chosen), nullptr);
    EXPECT_TRUE(journal.lines().empty());
}

TEST_F(Sink, DiscardsTheKindThatIsNoRecord) {
    sink.Start(host.factory());
    journal.clear();
    slog::CLoggerBaseEx& chosen = sink.Begin(1, "Somewhere", 0xFFFFFFFFu);
    EXPECT_NE(dynamic_cast<slog::CNullLoggerEx*>(&chosen), nullptr);
    EXPECT_TRUE(journal.lines().empty());
}

TEST_F(Sink, StartsOnce) {
    sink.Start(host.factory());
    sink.Start(host.factory());
    EXPECT_EQ(host.creations(CompID_LockComponent), 1);
}

TEST_F(Sink, ThrowsTheRefusalOfItsLockAndStaysStopped) {
    host.refuseCreation(CompID_LockComponent, NCF_E_ACCESSDENIED);
    try {
        sink.Start(host.factory());
        FAIL() << "nothing was thrown";
    } catch (NCFRESULT thrown) {
        EXPECT_EQ(thrown, NCF_E_ACCESSDENIED);
    }
    sink.Begin(1, "Somewhere", slog::kError);
    EXPECT_EQ(loggersMade, 0);
}

TEST_F(Sink, ThrowsWhenItsLockIsNotThereAndStaysStopped) {
    host.maker(CompID_LockComponent, [](const GUID&, void**) { return NCF_OK; });
    try {
        sink.Start(host.factory());
        FAIL() << "nothing was thrown";
    } catch (NCFRESULT thrown) {
        EXPECT_EQ(thrown, NCF_E_POINTER);
    }
    sink.Begin(1, "Somewhere", slog::kError);
    EXPECT_EQ(loggersMade, 0);
}

TEST_F(Sink, DiscardsWhenNoMainLoggerCanBeMadeAndGivesItsLockBack) {
    sink.SetLoggerMaker([]() -> slog::CLoggerBaseEx* { throw std::bad_alloc(); });
    sink.Start(host.factory());
    journal.clear();
    slog::CLoggerBaseEx& chosen = sink.Begin(1, "Somewhere", slog::kError);
    EXPECT_NE(dynamic_cast<slog::CNullLoggerEx*>(&chosen), nullptr);
    EXPECT_EQ(&sink.CurrentLogger(), &chosen);
    EXPECT_EQ(journal.lines(), (std::vector<std::string>{"lock", "unlock"}));
}

TEST_F(Sink, DiscardsARecordThatItsMainLoggerCannotBegin) {
    struct Throwing final : CountingLogger {
        void BeginRecord(ncfUInt32, const char*) override { throw std::bad_alloc(); }
    };
    sink.SetLoggerMaker([]() -> slog::CLoggerBaseEx* { return new Throwing; });
    sink.Start(host.factory());
    slog::CLoggerBaseEx& chosen = sink.Begin(1, "Somewhere", slog::kError);
    EXPECT_NE(dynamic_cast<slog::CNullLoggerEx*>(&chosen), nullptr);
    EXPECT_EQ(&sink.CurrentLogger(), &chosen);
}

TEST_F(Sink, MakesItsMainLoggerCurrentForARecord) {
    sink.Start(host.factory());
    slog::CLoggerBaseEx& chosen = sink.Begin(1, "Somewhere", slog::kError);
    EXPECT_NE(dynamic_cast<CountingLogger*>(&chosen), nullptr);
    EXPECT_EQ(&sink.CurrentLogger(), &chosen);
    sink.Begin(2, "Somewhere", slog::kError);
    EXPECT_NE(&sink.CurrentLogger(), &chosen) << "until a record is discarded";
}

TEST_F(Sink, DiscardsAfterItWasStopped) {
    sink.Start(host.factory());
    sink.Stop();
    sink.Stop();
    journal.clear();
    sink.Begin(1, "Somewhere", slog::kError);
    EXPECT_TRUE(journal.lines().empty());
}

TEST_F(Sink, MakesADiscardingMainLoggerUnlessTold) {
    sink.SetLoggerMaker(nullptr);
    sink.Start(host.factory());
    slog::CLoggerBaseEx& chosen = sink.Begin(1, "Somewhere", slog::kError);
    EXPECT_NE(dynamic_cast<slog::CNullLoggerEx*>(&chosen), nullptr);
}

// The order of a logger's operations is its interface to other sinks.
TEST(StreamLogger, KeepsTheOrderOfItsOperations) {
    Journal journal;
    struct Telling final : slog::CLoggerBaseEx {
        explicit Telling(Journal& lines) : lines_(lines) {}
        void BeginRecord(ncfUInt32, const char*) override { lines_.add("begin"); }
        void Hook() override { lines_.add("hook"); }
        void SetFlag(ncfUInt32) override { lines_.add("flag"); }
        void WriteDouble(double) override { lines_.add("double"); }
        void WriteSInt64(ncfSInt64) override { lines_.add("s64"); }
        void WriteUInt64(ncfUInt64) override { lines_.add("u64"); }
        void WriteUInt32(ncfUInt32) override { lines_.add("u32"); }
        void WriteSInt32(ncfSInt32) override { lines_.add("s32"); }
        void WriteString(const char*) override { lines_.add("string"); }
        void Manipulate(std::ios_base& (*)(std::ios_base&)) override { lines_.add("manipulate"); }
        void EndRecord() override { lines_.add("end"); }
        Journal& lines_;
    } logger(journal);
    slog::CLoggerBaseEx* const base = &logger;
    void** const table = *reinterpret_cast<void***>(base);
    reinterpret_cast<void (*)(void*, ncfUInt32, const char*)>(table[2])(base, 0, "");
    reinterpret_cast<void (*)(void*)>(table[3])(base);
    reinterpret_cast<void (*)(void*, ncfUInt32)>(table[4])(base, 1);
    reinterpret_cast<void (*)(void*, double)>(table[5])(base, 1.0);
    reinterpret_cast<void (*)(void*, ncfSInt64)>(table[6])(base, 1);
    reinterpret_cast<void (*)(void*, ncfUInt64)>(table[7])(base, 1);
    reinterpret_cast<void (*)(void*, ncfUInt32)>(table[8])(base, 1);
    reinterpret_cast<void (*)(void*, ncfSInt32)>(table[9])(base, 1);
    reinterpret_cast<void (*)(void*, const char*)>(table[10])(base, "");
    reinterpret_cast<void (*)(void*, void*)>(table[11])(base, nullptr);
    reinterpret_cast<void (*)(void*)>(table[12])(base);
    EXPECT_EQ(journal.lines(),
              (std::vector<std::string>{"begin", "hook", "flag", "double", "s64", "u64", "u32",
                                        "s32", "string", "manipulate", "end"}));
}

}  // namespace
