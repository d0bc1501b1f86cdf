// Handlers of an event can be ended, by their handle or with their owner.

#include <gtest/gtest.h>

#include <memory>
#include <string>

#include "platform/Event.h"

namespace zel {
namespace {

TEST(Event, EndedHandler_IsNotCalled) {
    Event<int> event;
    std::string calls;
    EventHandle first = event.connect([&](int n) { calls += "a" + std::to_string(n); });
    event.connect([&](int n) { calls += "b" + std::to_string(n); });
    event(1);
    first.end();
    event(2);
    EXPECT_EQ(calls, "a1b1b2");
    EXPECT_FALSE(first.connected());
}

TEST(Event, HandlerEndedWhileTheEventRuns_IsNotCalledAnyMore) {
    Event<> event;
    int calls = 0;
    EventHandle second;
    event.connect([&] { second.end(); });
    second = event.connect([&] { ++calls; });
    event();
    EXPECT_EQ(calls, 0);
}

TEST(Event, HandlerThatEndsItself_RunsToItsEnd) {
    Event<> event;
    std::string text;
    EventHandle self;
    self = event.connect([&, kept = std::string("kept")] {
        self.end();
        event.connect([] {});  // the list changes under the handler
        text = kept;
    });
    event();
    event();
    EXPECT_EQ(text, "kept");
}

TEST(Event, Owner_TakesItsHandlersWithIt) {
    struct Owner {
        explicit Owner(Event<>& event, int& calls) {
            handlers.on(event, [&calls] { ++calls; });
        }
        Handlers handlers;
    };
    Event<> event;
    int calls = 0;
    auto owner = std::make_unique<Owner>(event, calls);
    event();
    owner.reset();
    event();
    EXPECT_EQ(calls, 1);
    EXPECT_FALSE(event.connected());
}

TEST(Event, HandleOfAnEventThatIsGone_DoesNothing) {
    EventHandle handle;
    Handlers handlers;
    {
        Event<> event;
        handle = handlers.on(event, [] {});
        EXPECT_TRUE(handle.connected());
    }
    EXPECT_FALSE(handle.connected());
    handle.end();
    handlers.end();
}

}  // namespace
}  // namespace zel
