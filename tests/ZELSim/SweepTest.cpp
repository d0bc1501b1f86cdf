#include <algorithm>
#include <cmath>

#include "ZELSim/Markers.h"
#include "ZELSim/Network.h"
#include "tests/ZELSim/WireFixture.h"

namespace zelsim {
namespace {

TEST(Sweep, SameSeedAndTime_GivesTheSameBytes) {
    Host one;
    Host other;
    EXPECT_TRUE(one.sweep() == other.sweep());
    EXPECT_TRUE(one.sweep() == other.sweep());
}

TEST(Sweep, TimeInSmallSteps_GivesTheSameBytesAsInOne) {
    Host one;
    Host other;
    Host early;
    // Tenths have no exact form: their sum is not quite the whole.
    one.wire.advance(1.3);
    for (int i = 0; i < 13; ++i) {
        other.wire.advance(0.1);
    }
    EXPECT_GT(one.device.sweepsFinished(), 1U);
    EXPECT_EQ(one.device.sweepsFinished(), other.device.sweepsFinished());
    const std::string bytes = one.get("TRACEBIN");
    EXPECT_TRUE(bytes == other.get("TRACEBIN"));
    EXPECT_TRUE(bytes != early.get("TRACEBIN"));
}

TEST(Sweep, AnotherSeed_GivesOtherNoise) {
    DeviceSetup setup;
    setup.seed = 2;
    Host one;
    Host other(setup);
    EXPECT_TRUE(one.sweep() != other.sweep());
}

TEST(Sweep, EachSweep_HasNoiseOfItsOwn) {
    Host host;
    EXPECT_TRUE(host.sweep() != host.sweep());
}

TEST(Sweep, TraceWithoutANewSweep_IsTheSame) {
    Host host;
    host.setUp({"SWPCONT,0"});
    host.wire.advance(1);
    const std::string before = host.get("TRACEBIN");
    host.wire.advance(1);
    EXPECT_TRUE(host.get("TRACEBIN") == before);
}

TEST(Sweep, Carrier_StandsAtItsFrequencyAndLevel) {
    for (const char* detector : {"TRACEDET,2", "TRACEDET,3", "TRACEDET,4"}) {
        Host host;
        host.setUp({"FREQ,1500000000", "SPAN,30000000", "RBW,8", detector});
        const auto levels = host.levels();
        const auto peak = highestPoint(levels);
        EXPECT_NEAR(static_cast<double>(peak), 150, 1) << detector;
        EXPECT_NEAR(levels[peak], -30000, 1000) << detector;
    }
}

TEST(Sweep, CarrierBetweenTwoPoints_IsSeenByThePeakDetectorAtFullSpan) {
    Host host;
    const auto highest = decodeBlock(host.sweep(), 1205);
    EXPECT_NEAR(highest[43], -48000, 1000);  // 433.92 MHz in steps of 10 MHz
}

TEST(Sweep, NoiseFloor_RisesTenDecibelsADecadeOfBandwidth) {
    const auto floor = [](const char* rbw) {
        Host host;
        host.setUp({"FREQ,1300000000", "SPAN,50000000", "TRACEDET,4", rbw});
        return meanOf(host.levels());
    };
    const double narrow = floor("RBW,5");
    const double middle = floor("RBW,7");
    const double wide = floor("RBW,9");
    EXPECT_NEAR(middle - narrow, 10000, 500);
    EXPECT_NEAR(wide - middle, 10000, 500);
}

TEST(Sweep, NoiseFloor_RisesWithTheAttenuatorAndFallsWithLowNoise) {
    const auto floor = [](const char* setting) {
        Host host;
        host.setUp({"FREQ,1300000000", "SPAN,50000000", "TRACEDET,4", setting});
        return meanOf(host.levels());
    };
    const double usual = floor("REFLVL,-20");
    EXPECT_NEAR(floor("REFLVL,0") - usual, 20000, 1000);
    EXPECT_NEAR(floor("DYNRANGE,1") - usual, -8000, 1000);
}

TEST(Sweep, Detectors_SeeTheSameSweepInOrder) {
    const auto trace = [](int detector) {
        Host host;
        host.setUp({"TRACEDET," + std::to_string(detector)});
        return host.levels();
    };
    const auto least = trace(1);
    const auto most = trace(2);
    const auto sample = trace(3);
    const auto mean = trace(4);
    for (std::size_t i = 0; i < kPoints; ++i) {
        EXPECT_LE(least[i], sample[i] + 0.5) << i;
        EXPECT_LE(sample[i], most[i] + 0.5) << i;
    }
    EXPECT_GT(meanOf(most) - meanOf(mean), 5000);
    EXPECT_GT(meanOf(mean) - meanOf(least), 10000);
}

TEST(Sweep, AutoPeak_SendsTheLeastValuesFirst) {
    Host host;
    const std::string bytes = host.sweep();
    ASSERT_EQ(bytes.size(), 2410U);
    const auto low = decodeBlock(bytes, 0);
    const auto high = decodeBlock(bytes, 1205);
    for (std::size_t i = 0; i < kPoints; ++i) {
        EXPECT_LT(low[i], high[i]) << i;
    }
}

TEST(Sweep, VideoFilter_SmoothsTheNoise) {
    const auto spread = [](const char* vbw) {
        Host host;
        host.setUp({"FREQ,1300000000", "SPAN,50000000", "TRACEDET,3", "RBW,7", vbw});
        const auto levels = host.levels();
        const auto [least, most] = std::minmax_element(levels.begin(), levels.end());
        return *most - *least;
    };
    EXPECT_GT(spread("VBW,9"), 4 * spread("VBW,3"));
}

TEST(Sweep, Units_ScaleTheSamples) {
    const auto peak = [](const char* unit) {
        Host host;
        host.setUp({"FREQ,1500000000", "SPAN,10000000", "TRACEDET,2", unit});
        const auto levels = host.levels();
        return *std::max_element(levels.begin(), levels.end());
    };
    EXPECT_NEAR(peak("UNIT,0"), -30000, 100);
    EXPECT_NEAR(peak("UNIT,1"), -30000 + 46990, 100);
    EXPECT_NEAR(peak("UNIT,2"), -30000 + 106990, 100);
    EXPECT_NEAR(peak("UNIT,6"), 7071, 100);  // microvolts across 50 Ohm
    EXPECT_NEAR(peak("UNIT,7"), 1000, 30);   // nanowatts
}

TEST(Sweep, ReferenceOffsetAndTransducer_AreAddedToTheLevels) {
    const auto peak = [](const char* setting) {
        Host host;
        host.setUp({"FREQ,1500000000", "SPAN,10000000", "TRACEDET,2", setting});
        const auto levels = host.levels();
        return *std::max_element(levels.begin(), levels.end());
    };
    const double plain = peak("REFLVLOFFS,0");
    EXPECT_NEAR(peak("REFLVLOFFS,12.5") - plain, 12500, 1);
    EXPECT_NEAR(peak("TRD1,HORN") - plain, transducerFactor("HORN", 1.5e9) * 1000, 20);
}

TEST(Sweep, Burst_ShowsItsSlotsAtZeroSpan) {
    Host host;
    host.setUp({"FREQ,947400000", "SPAN,0", "RBW,9", "SWPTIME,0.00923077", "TRACEDET,2"});
    const auto levels = host.levels();
    EXPECT_NEAR(*std::max_element(levels.begin(), levels.end()), -35000, 500);
    // Two frames with one full slot each.
    const auto on =
        std::count_if(levels.begin(), levels.end(), [](double l) { return l > -37000; });
    EXPECT_NEAR(static_cast<double>(on) / 301 * 0.00923077 / 2, 577e-6, 60e-6);
}

TEST(Sweep, Drifting_MovesFromSweepToSweep) {
    Host host;
    host.setUp({"FREQ,1800000000", "SPAN,20000000", "TRACEDET,2"});
    const auto before = highestPoint(host.levels());
    host.wire.advance(10);
    EXPECT_NE(highestPoint(host.levels()), before);
}

TEST(Sweep, FmSignal_IsAsWideAsItsDeviation) {
    Host host;
    host.setUp({"FREQ,98500000", "SPAN,600000", "RBW,4", "TRACEDET,2", "SWPTIME,1"});
    const auto levels = host.levels();
    const auto on =
        std::count_if(levels.begin(), levels.end(), [](double l) { return l > -41000; });
    EXPECT_NEAR(static_cast<double>(on) * 2000, 150e3, 12e3);
}

TEST(Sweep, MaxHold_NeverFallsAndAverageIsSmoother) {
    Host host;
    host.setUp({"FREQ,1300000000", "SPAN,50000000", "TRACEDET,3", "TRACEMODE,3"});
    const auto first = host.levels();
    host.wire.advance(1);
    const auto later = host.levels();
    for (std::size_t i = 0; i < kPoints; ++i) {
        EXPECT_GE(later[i], first[i]);
    }
    EXPECT_GT(meanOf(later), meanOf(first) + 2000);
}

TEST(Sweep, MinHold_FallsBelowASingleSweep) {
    Host host;
    host.setUp({"FREQ,1300000000", "SPAN,50000000", "TRACEDET,3", "TRACEMODE,2"});
    const auto first = host.levels();
    host.wire.advance(1);
    EXPECT_LT(meanOf(host.levels()), meanOf(first) - 5000);
}

TEST(Sweep, Average_IsSmootherThanOneSweep) {
    const auto spread = [](const char* mode) {
        Host host;
        host.setUp({"FREQ,1300000000", "SPAN,50000000", "TRACEDET,4", "RBW,6", "VBW,8", mode});
        host.wire.advance(2);
        const auto levels = host.levels();
        const double mean = meanOf(levels);
        double sum = 0;
        for (const double level : levels) {
            sum += (level - mean) * (level - mean);
        }
        return std::sqrt(sum / static_cast<double>(kPoints));
    };
    EXPECT_GT(spread("TRACEMODE,0"), 2 * spread("TRACEMODE,1"));
}

TEST(Sweep, View_FreezesTheTrace) {
    Host host;
    host.setUp({});
    host.sweep();
    EXPECT_EQ(host.set("TRACEMODE,4"), "0\r");
    const std::string frozen = host.get("TRACEBIN");
    host.wire.advance(5);
    EXPECT_TRUE(host.get("TRACEBIN") == frozen);
}

TEST(Sweep, VideoTrigger_StartsTheSweepOnTheBurst) {
    Host host;
    host.setUp({"FREQ,947400000", "SPAN,0", "RBW,9", "SWPTIME,0.004", "TRACEDET,2", "REFLVL,-30",
                "TRIGSRC,1", "TRIGLVL,90"});
    for (int i = 0; i < 5; ++i) {
        const auto levels = host.levels();
        EXPECT_GT(levels[3], -36000) << i;
        EXPECT_LT(levels[60], -60000) << i;  // 0.8 ms on, the burst is over
        host.wire.advance(0.00123);
    }
}

TEST(Sweep, ExternalTrigger_IsWaitedFor) {
    Host host;
    host.setUp({"SWPCONT,0", "TRIGSRC,2"});
    host.wire.advance(0.9);
    EXPECT_EQ(host.cmd("INIT"), "0\r");
    EXPECT_EQ(host.cmd("WAIT"), "");
    host.wire.advance(0.119);  // edge at 1.0 s, sweep of 20 ms
    EXPECT_EQ(host.wire.take(), "");
    host.wire.advance(0.002);
    EXPECT_EQ(host.wire.take(), "0\r");
}

TEST(Sweep, ExternalTriggerThatNeverComes_LeavesWaitUnanswered) {
    DeviceSetup setup;
    setup.triggerPeriod = 0;
    Host host(setup);
    host.setUp({"TRIGSRC,3"});
    EXPECT_EQ(host.cmd("WAIT"), "");
    EXPECT_FALSE(host.wire.nextDue());
    host.wire.advance(1e6);
    EXPECT_EQ(host.wire.take(), "");
}

TEST(Sweep, ContinuousSweepOverAYear_IsCountedWithoutMakingIt) {
    Host host;
    host.wire.advance(3e7);
    EXPECT_GT(host.device.sweepsFinished(), 1000000000U);
    EXPECT_EQ(host.sweep().size(), 2410U);
}

}  // namespace
}  // namespace zelsim
