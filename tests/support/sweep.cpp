#include "support/sweep.h"

namespace marlowbeck {
namespace {

constexpr int kMostOperations = 5000;
constexpr std::size_t kBytesLeftByCut = 70;  // within the first record

/// What a power cut is in a test: all is left as it lies. Nothing in the program catches it.
struct PowerCut {};

void Carry(Club& club, const SweptWork& work) {
  for (const std::string& line : work.lines) club.Try(line);
}

/// Breaks the work at its nth operation. Answers false when there are not so many.
using Break = std::function<bool(Club&, int nth)>;

int Sweep(const SweptWork& work, const char* what, const Break& broken) {
  for (int nth = 1; nth < kMostOperations; ++nth) {
    SCOPED_TRACE(std::string(what) + " at operation " + std::to_string(nth));
    Club club(ModelFaceAlone());
    work.prepare(club);
    const bool reached = broken(club, nth);
    work.check(club);
    if (::testing::Test::HasFatalFailure()) return nth;
    if (!reached) {
      EXPECT_GT(nth, 1) << "the work has no file operation to break";
      return nth - 1;
    }
  }
  ADD_FAILURE() << "the work never goes through";
  return kMostOperations;
}

long WritesDone(const FaultPlan& plan) {
  return plan.Done(FileOperation::Write) + plan.Done(FileOperation::Copy);
}

}  // namespace

int SweepFailures(const SweptWork& work, int error_number) {
  return Sweep(work, "failure", [&](Club& club, int nth) {
    const long before = club.Faults().DoneInAll();
    club.Faults().FailAt(std::nullopt, nth, error_number, false);
    Carry(club, work);
    club.Faults().Off();
    return club.Faults().DoneInAll() - before >= nth;
  });
}

int SweepCutWrites(const SweptWork& work, int error_number) {
  return Sweep(work, "cut write", [&](Club& club, int nth) {
    const long before = WritesDone(club.Faults());
    club.Faults().CutAt(nth, kBytesLeftByCut, error_number);
    Carry(club, work);
    club.Faults().Off();
    return WritesDone(club.Faults()) - before >= nth;
  });
}

int SweepPowerCuts(const SweptWork& work) {
  return Sweep(work, "power cut", [&](Club& club, int nth) {
    club.Faults().kill = [] { throw PowerCut{}; };
    club.Faults().CrashAt(std::nullopt, nth);
    bool reached = false;
    try {
      Carry(club, work);
    } catch (const PowerCut&) {
      reached = true;
    }
    club.Restart();
    return reached;
  });
}

}  // namespace marlowbeck
