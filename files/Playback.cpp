#include "files/Playback.h"

#include <algorithm>
#include <memory>
#include <optional>
#include <string>
#include <utility>

#include "files/SeriesFrames.h"
#include "forms/Forms.h"
#include "platform/Clock.h"
#include "platform/Form.h"
#include "trace/Interlock.h"

namespace zel {
namespace {

constexpr int kSliceMs = 100;
constexpr int kShortestRoundMs = 20;

}  // namespace

Playback::Playback(Forms& forms, const Interlock& interlock)
    : forms_(forms),
      panel_(forms.controller),
      interlock_(interlock),
      clock_(interlock.session().clock),
      events_(interlock.session().events) {
    handlers_.on(panel_.PlaybackPlay.Clicked, [this] { PlaybackPlay_Click(); });
    handlers_.on(panel_.PlaybackBack.Clicked, [this] { goTo(position_ - 1); });
    handlers_.on(panel_.PlaybackForward.Clicked, [this] { goTo(position_ + 1); });
    handlers_.on(panel_.PlaybackPosition.Scrolled,
                 [this] { goTo(panel_.PlaybackPosition.Value - 1); });
    handlers_.on(panel_.PlaybackClose.Clicked, [this] {
        panel_.STOPFlag = panel_.STOPFlag && !playing();
        close();
    });
    // A sweep of the instrument takes the place of the recording.
    handlers_.on(panel_.CWGraph1.Changed, [this] {
        if (frames_ && !panel_.Shown.fromFile) close();
    });
    showState();
}

void Playback::open(std::shared_ptr<SeriesFrames> frames) {
    frames_ = std::move(frames);
    wanted_ = -1;
    panel_.PlaybackRepeat.setValue(false);
    setPosition(0);
}

void Playback::close() {
    frames_.reset();
    showState();
}

void Playback::setPosition(int index) {
    position_ = index;
    showState();
}

void Playback::setPlaying(bool playing) {
    panel_.SeriesPlays = playing;
    showState();
}

void Playback::showState() {
    for (Control* control :
         {static_cast<Control*>(&panel_.PlaybackFrame), static_cast<Control*>(&panel_.PlaybackBack),
          static_cast<Control*>(&panel_.PlaybackPlay),
          static_cast<Control*>(&panel_.PlaybackForward),
          static_cast<Control*>(&panel_.PlaybackPosition),
          static_cast<Control*>(&panel_.PlaybackLabel),
          static_cast<Control*>(&panel_.PlaybackRepeat),
          static_cast<Control*>(&panel_.PlaybackRealTime),
          static_cast<Control*>(&panel_.PlaybackClose)})
        control->Visible = frames_ != nullptr;
    panel_.PlaybackPlay.Caption = panel_.SeriesPlays ? "Pause" : "Play";
    const int count = frames_ ? frames_->count() : 1;
    panel_.PlaybackPosition.Min = 1;
    panel_.PlaybackPosition.Max = std::max(count, 1);
    panel_.PlaybackPosition.Value = frames_ ? position_ + 1 : 1;
    panel_.PlaybackBack.Enabled = frames_ && position_ > 0;
    panel_.PlaybackForward.Enabled = frames_ && position_ + 1 < count;
    std::string text;
    if (frames_)
        text = std::to_string(position_ + 1) + " of " + std::to_string(count) + "   " +
               frames_->at(position_).time;
    panel_.PlaybackLabel.Caption = text;
}

void Playback::PlaybackPlay_Click() {
    if (!frames_) return;
    if (playing()) {
        panel_.STOPFlag = false;
        return;
    }
    if (interlock_.refuses(panel_.PlaybackPlay)) return;
    Play(frames_->reach(position_ + 1) ? position_ : 0);
}

void Playback::goTo(int index) {
    if (!frames_) return;
    const int to = std::clamp(index, 0, std::max(frames_->count() - 1, 0));
    if (playing()) {
        wanted_ = to;
        return;
    }
    if (interlock_.refuses(panel_.PlaybackPosition) || to == position_) return showState();
    Jump(to);
}

bool Playback::stands(int ms) const {
    // The keys may change while a trace stands.
    return ms < (panel_.PlaybackRealTime.Value() ? frames_->gapAfter(position_)
                                                 : forms_.specialMeas.seriesPauseMs());
}

std::optional<int> Playback::next() {
    const std::shared_ptr<SeriesFrames> mine = frames_;
    if (!mine) return std::nullopt;
    wanted_ = -1;
    const bool last = !mine->reach(position_ + 1);
    if (last && !panel_.PlaybackRepeat.Value()) return std::nullopt;
    const Stopwatch watch(clock_);
    while (panel_.STOPFlag && frames_ == mine && wanted_ < 0 && stands(watch.Elapsed()))
        events_.wait(kSliceMs);
    // However quick the pace, a short series leaves time for other work before it begins again.
    if (last && panel_.STOPFlag) events_.wait(kShortestRoundMs);
    events_.pump();
    if (frames_ != mine || !panel_.STOPFlag || forms_.specialMeas.sldSpeed.Value < 0)
        return std::nullopt;
    if (wanted_ >= 0) return wanted_;
    return last ? 0 : position_ + 1;
}

}  // namespace zel
