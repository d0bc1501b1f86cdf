#pragma once
// The keys that play a loaded recording: pace, position, forth and back, again and again.

#include <memory>
#include <optional>

#include "files/SeriesFrames.h"
#include "forms/Forms.h"
#include "platform/Clock.h"
#include "platform/Event.h"
#include "platform/Events.h"
#include "trace/Interlock.h"

namespace zel {

class Playback {
  public:
    Playback(Forms& forms, const Interlock& interlock);

    /// The user wants the trace of that index on the graph, while nothing plays.
    Event<int> Jump;
    /// The user wants the series to play from that index on.
    Event<int> Play;

    /// A series is there; its keys show as long as it is.
    void open(std::shared_ptr<SeriesFrames> frames);
    /// The series goes and its memory with it.
    void close();
    const std::shared_ptr<SeriesFrames>& frames() const { return frames_; }
    /// The trace on the graph.
    int position() const { return position_; }
    void setPosition(int index);
    /// The loop that shows the traces begins or ends.
    void setPlaying(bool playing);
    bool playing() const { return panel_.SeriesPlays; }
    /// Waits as long as the trace at hand stands. Returns the index of the one to show then,
    /// or nothing when the loop has to end.
    std::optional<int> next();

  private:
    void PlaybackPlay_Click();
    void goTo(int index);
    void showState();
    bool stands(int ms) const;

    Forms& forms_;
    ControllerForm& panel_;
    const Interlock& interlock_;
    const Clock& clock_;
    Events& events_;
    std::shared_ptr<SeriesFrames> frames_;
    int position_ = 0;
    int wanted_ = -1;
    Handlers handlers_;
};

}  // namespace zel
