// Timecode text: formatting and reading.
//
// Both directions work on the raw tick count and ticks per frame, with every
// product and sum that could leave 64 bits checked, and build the text in a
// small buffer on the stack: the only allocation is the returned string.
#include <zebmediatypes/ratio_time.h>
#include <zebmediatypes/timecode.h>

#include <array>
#include <cstddef>
#include <cstdint>
#include <limits>

namespace zebmediatypes {
namespace {

using TimecodeFlags = zebcore::utility::Flags<unsigned int>;

constexpr std::int64_t kTicksPerMillisecond = 254016000;

// The numbering of a drop-frame display: labels ;00 and ;01 (;00 to ;03 at
// 59.94) are skipped at the start of every minute that is not a multiple of ten.
struct DropFrameNumbering {
  std::int64_t labelsPerSecond;
  std::int64_t droppedLabels;
  std::int64_t firstMinuteFrames;
  std::int64_t otherMinuteFrames;
  std::int64_t tenMinuteFrames;
  std::int64_t hourFrames;
};

constexpr bool IsConsistent(const DropFrameNumbering& n) {
  return n.firstMinuteFrames == 60 * n.labelsPerSecond &&
         n.otherMinuteFrames == n.firstMinuteFrames - n.droppedLabels &&
         n.tenMinuteFrames == n.firstMinuteFrames + 9 * n.otherMinuteFrames &&
         n.hourFrames == 6 * n.tenMinuteFrames;
}

constexpr DropFrameNumbering kDropFrame2997{30, 2, 1800, 1798, 17982, 107892};
constexpr DropFrameNumbering kDropFrame5994{60, 4, 3600, 3596, 35964, 215784};
static_assert(IsConsistent(kDropFrame2997) && IsConsistent(kDropFrame5994));

bool IsKnownDisplayType(TimeDisplayType type) noexcept {
  const int code = static_cast<int>(type);
  return (code >= kTimeDisplay_24Timecode && code <= kTimeDisplay_14985Timecode) ||
         code == kTimeDisplay_AudioSamplesTimecode || code == kTimeDisplay_AudioMsTimecode ||
         code == kTimeDisplay_CustomFrameRateTimecode;
}

// The default display (and a code that names no display) becomes the media's
// standard display.
TimeDisplay ResolveDisplay(TimeDisplay display, FrameRate rate) {
  if (IsKnownDisplayType(display.GetType())) return display;
  return GetTimeDisplayForFrameRate(rate, true, true, kTimeDisplay_2997DropTimecode, false);
}

const DropFrameNumbering* DropFrameNumberingOf(TimeDisplay display) noexcept {
  switch (display.GetType()) {
    case kTimeDisplay_2997DropTimecode:
      return &kDropFrame2997;
    case kTimeDisplay_5994DropTimecode:
      return &kDropFrame5994;
    default:
      return nullptr;
  }
}

bool IsFilmDisplay(TimeDisplay display) noexcept {
  return display.GetType() == kTimeDisplay_16mmFeetFrames ||
         display.GetType() == kTimeDisplay_35mmFeetFrames;
}

std::int64_t FramesPerFoot(TimeDisplay display) noexcept {
  return display.GetType() == kTimeDisplay_16mmFeetFrames ? 40 : 16;
}

// Audio media at one of the named sample rates is counted in frames of the
// display's nominal rate rather than in samples.
FrameRate CountingRate(FrameRate rate, TimeDisplay display) {
  return details::IsAudioRateConstant(rate) ? GetFrameRateForTimeDisplay(display, rate) : rate;
}

// Display frames per second, at least 1 (a custom display may hold 0).
std::uint64_t DisplayFramesPerSecond(TimeDisplay display, FrameRate rate) {
  const auto f = static_cast<std::uint64_t>(display.GetDisplayFramesPerSecond(rate));
  return f < 1 ? 1 : f;
}

std::int64_t FrameCount(std::int64_t ticks, FrameRate rate) noexcept {
  return rate.IsValid() ? ticks / rate.GetTicksPerFrame() : 0;
}

std::uint64_t Magnitude(std::int64_t v) noexcept {
  return v < 0 ? 0 - static_cast<std::uint64_t>(v) : static_cast<std::uint64_t>(v);
}

struct Fields {
  std::uint64_t hours = 0;
  std::uint64_t minutes = 0;
  std::uint64_t seconds = 0;
  std::uint64_t frames = 0;
  bool negative = false;
  std::uint64_t framesPerSecond = 0;  // of the display
};

// The drop-frame fields of a frame count's magnitude. The numbering is a
// template argument so that every division is by a constant.
template <const DropFrameNumbering& n>
void ComputeDropFrameFields(std::uint64_t magnitude, Fields& out) {
  auto c = static_cast<std::int64_t>(magnitude % static_cast<std::uint64_t>(24 * n.hourFrames));
  out.hours = static_cast<std::uint64_t>(c / n.hourFrames);
  c %= n.hourFrames;
  std::int64_t minutes = 10 * (c / n.tenMinuteFrames);
  c %= n.tenMinuteFrames;
  if (c >= n.firstMinuteFrames) {
    const std::int64_t k = (c - n.firstMinuteFrames) / n.otherMinuteFrames + 1;
    minutes += k;
    c -= k * n.otherMinuteFrames;
  }
  out.framesPerSecond = static_cast<std::uint64_t>(n.labelsPerSecond);
  out.minutes = static_cast<std::uint64_t>(minutes);
  out.seconds = static_cast<std::uint64_t>(c / n.labelsPerSecond);
  out.frames = static_cast<std::uint64_t>(c % n.labelsPerSecond);
}

// The fields of an hours:minutes:seconds:frames display (every display but the
// frame count).
Fields ComputeFields(std::int64_t ticks, FrameRate rate, TimeDisplay display) {
  Fields out;
  if (const DropFrameNumbering* drop = DropFrameNumberingOf(display)) {
    const FrameRate counting = CountingRate(rate, display);
    // The sign of the time, except that without a rate every time is zero.
    out.negative = ticks < 0 && counting.IsValid();
    const std::uint64_t magnitude = Magnitude(FrameCount(ticks, counting));
    if (drop == &kDropFrame2997) {
      ComputeDropFrameFields<kDropFrame2997>(magnitude, out);
    } else {
      ComputeDropFrameFields<kDropFrame5994>(magnitude, out);
    }
    return out;
  }
  std::uint64_t a = 0;
  std::uint64_t f = 1000;
  if (display.GetType() == kTimeDisplay_AudioMsTimecode) {
    const std::int64_t ms = ticks / kTicksPerMillisecond;
    out.negative = ms < 0;
    a = Magnitude(ms);
  } else {
    const std::int64_t c = FrameCount(ticks, CountingRate(rate, display));
    out.negative = c < 0;
    a = Magnitude(c);
    f = DisplayFramesPerSecond(display, rate);
  }
  // One division by the display count; the rest are by constants.
  const std::uint64_t totalSeconds = a / f;
  out.framesPerSecond = f;
  out.frames = a - totalSeconds * f;
  out.hours = (totalSeconds / 3600) % 24;
  out.minutes = (totalSeconds / 60) % 60;
  out.seconds = totalSeconds % 60;
  return out;
}

// Digits of the frame field: those of the largest frame label, f - 1.
std::size_t FrameFieldWidth(std::uint64_t framesPerSecond) noexcept {
  std::size_t width = 1;
  for (std::uint64_t largest = framesPerSecond - 1; largest >= 10; largest /= 10) ++width;
  return width;
}

// A short ASCII text built in place and widened once at the end.
class TextBuffer {
 public:
  void Put(char c) noexcept { text_[size_++] = c; }
  // `value` in decimal, zero-padded on the left to at least `width` digits.
  void PutUnsigned(std::uint64_t value, std::size_t width = 1) noexcept {
    char digits[20];
    std::size_t n = 0;
    do {
      digits[n++] = static_cast<char>('0' + value % 10);
      value /= 10;
    } while (value != 0);
    for (; width > n && width > 0; --width) Put('0');
    while (n > 0) Put(digits[--n]);
  }
  void PutSigned(std::int64_t value) noexcept {
    if (value < 0) Put('-');
    PutUnsigned(Magnitude(value));
  }
  void Prepend(const char* prefix, std::size_t length) noexcept {
    for (std::size_t i = size_; i-- > 0;) text_[i + length] = text_[i];
    for (std::size_t i = 0; i < length; ++i) text_[i] = prefix[i];
    size_ += length;
  }
  const char* data() const noexcept { return text_.data(); }
  std::size_t size() const noexcept { return size_; }

  zebcore::UTF16String ToUTF16() const {
    zebcore::UTF16String out(size_, u'\0');
    for (std::size_t i = 0; i < size_; ++i) out[i] = static_cast<char16_t>(text_[i]);
    return out;
  }

 private:
  // Sign, 20 digits of feet, '+', 2 digits is the longest text; an HMSF text is
  // at most 3 + 3 + 3 + 2 + 1 + 10 characters, widened by 3.
  std::array<char, 48> text_{};
  std::size_t size_ = 0;
};

void FormatHMSF(TextBuffer& text, std::int64_t ticks, FrameRate rate, TimeDisplay display,
                TimecodeFlags flags) {
  const Fields fields = ComputeFields(ticks, rate, display);
  const bool trim = flags.IsSet(kTimecodeFlag_TrimLeadingZeros);
  const char separator =
      display.IsDropFrame() && !flags.IsSet(kTimecodeFlag_ColonSeparators) ? ';' : ':';
  bool written = false;
  if (!flags.IsSet(kTimecodeFlag_OmitHours)) {
    std::uint64_t h = fields.hours;
    if (fields.negative && !flags.IsSet(kTimecodeFlag_ShowSign)) h = 23 - h;
    if (h != 0 || !trim) {
      text.PutUnsigned(h, trim ? 1 : 2);
      text.Put(separator);
      written = true;
    }
  }
  if (fields.minutes != 0 || !trim || written) {
    text.PutUnsigned(fields.minutes, !trim || written ? 2 : 1);
    text.Put(separator);
    written = true;
  }
  text.PutUnsigned(fields.seconds, !trim || written ? 2 : 1);
  text.Put(display.GetType() == kTimeDisplay_AudioMsTimecode ? '.' : separator);
  text.PutUnsigned(fields.frames, FrameFieldWidth(fields.framesPerSecond));

  // Widening to minutes: only a text with one non-digit (seconds and frames,
  // no sign) is widened, and with the field separator even when the one
  // non-digit is the milliseconds point.
  if (trim && flags.IsSet(kTimecodeFlag_KeepMinutes) && text.size() > 0) {
    std::size_t nonDigits = 0;
    std::size_t digitsBefore = 0;
    for (std::size_t i = 0; i < text.size(); ++i) {
      const char c = text.data()[i];
      if (c < '0' || c > '9') {
        if (nonDigits++ == 0) digitsBefore = i;
      }
    }
    if (nonDigits == 1) {
      const char prefix[3] = {'0', separator, '0'};
      text.Prepend(prefix, digitsBefore < 2 ? 3 : 2);
    }
  }
}

// ---- Reading ----

constexpr std::int64_t kInt64Max = std::numeric_limits<std::int64_t>::max();

// A reading's outcome: a tick count, or nothing when the text does not read.
struct Reading {
  bool ok = false;
  std::int64_t ticks = 0;
};

constexpr Reading kUnreadable{};
constexpr Reading Ticks(std::int64_t ticks) { return Reading{true, ticks}; }

// count frames of `rate`; no rate holds only a zero count.
Reading TimeOfCount(std::int64_t count, FrameRate rate) noexcept {
  if (!rate.IsValid()) return count == 0 ? Ticks(0) : kUnreadable;
  std::int64_t ticks = 0;
  if (__builtin_mul_overflow(count, rate.GetTicksPerFrame(), &ticks)) return kUnreadable;
  return Ticks(ticks);
}

Reading Negate(Reading r, bool negative) noexcept {
  if (!r.ok || !negative) return r;
  if (r.ticks == std::numeric_limits<std::int64_t>::min()) return kUnreadable;
  r.ticks = -r.ticks;
  return r;
}

// The inclusive end names the frame before the end: one frame of the media
// forward, whatever the sign.
Reading MoveToExclusiveEnd(Reading r, FrameRate rate, bool inclusive) noexcept {
  if (!r.ok || !inclusive || !rate.IsValid()) return r;
  if (__builtin_add_overflow(r.ticks, rate.GetTicksPerFrame(), &r.ticks)) return kUnreadable;
  return r;
}

Reading FieldsToTime(std::uint64_t hours, std::uint64_t minutes, std::uint64_t seconds,
                     std::uint64_t frames, bool negative, FrameRate rate, TimeDisplay display) {
  display = ResolveDisplay(display, rate);
  const bool ms = display.GetType() == kTimeDisplay_AudioMsTimecode;
  const DropFrameNumbering* drop = DropFrameNumberingOf(display);
  const std::uint64_t f = ms ? 1000 : DisplayFramesPerSecond(display, rate);

  // Carrying frames into seconds into minutes into hours and wrapping hours at
  // 24 keeps the total seconds modulo one day; taking each part modulo the day
  // first gives the same result without overflow.
  constexpr std::uint64_t kDay = 86400;
  const std::uint64_t total =
      ((hours % 24) * 3600 + (minutes % 1440) * 60 + seconds % kDay + (frames / f) % kDay) % kDay;
  frames %= f;
  const auto h = static_cast<std::int64_t>(total / 3600);
  const auto m = static_cast<std::int64_t>((total / 60) % 60);
  const auto s = static_cast<std::int64_t>(total % 60);
  const auto fr = static_cast<std::int64_t>(frames);

  Reading time;
  if (drop) {
    const auto& n = *drop;
    std::int64_t count = (m / 10) * n.tenMinuteFrames + h * n.hourFrames;
    const std::int64_t u = m % 10;
    if (u == 0) {
      count += s * n.labelsPerSecond + fr;
    } else {
      count += (u - 1) * n.otherMinuteFrames + n.firstMinuteFrames;
      if (s > 0) {
        count += (s - 1) * n.labelsPerSecond + (n.labelsPerSecond - n.droppedLabels) + fr;
      } else if (fr > 0) {
        count += fr - n.droppedLabels;
      }
    }
    time = TimeOfCount(count, CountingRate(rate, display));
  } else if (ms) {
    TickTime t(static_cast<std::int64_t>(total * 1000) + fr, kFrameRate_Milliseconds);
    t.AlignToFrame(rate);
    time = Ticks(t.GetTicks());
  } else {
    time = TimeOfCount(static_cast<std::int64_t>(f * total) + fr, CountingRate(rate, display));
  }
  return Negate(time, negative);
}

bool IsSeparator(char16_t c) noexcept { return c == u':' || c == u';' || c == u'.'; }
bool IsDigit(char16_t c) noexcept { return c >= u'0' && c <= u'9'; }

// Appends one digit to a non-negative 64-bit value; false on overflow.
bool AppendDigit(std::int64_t& value, char16_t digit) noexcept {
  const std::int64_t d = digit - u'0';
  if (value > (kInt64Max - d) / 10) return false;
  value = value * 10 + d;
  return true;
}

Reading ReadHMSF(std::u16string_view text, FrameRate rate, TimeDisplay display, bool inclusive) {
  std::size_t i = 0;
  bool negative = false;
  if (text[i] == u'-') {
    negative = true;
    ++i;
  } else if (text[i] == u'+') {
    ++i;
  }
  if (i == text.size()) return kUnreadable;
  bool rawCount = false;
  if (IsSeparator(text[i])) {
    rawCount = true;
    if (++i == text.size()) return kUnreadable;
  }
  const bool frameDisplay = display.GetType() == kTimeDisplay_Frames;
  std::int64_t fields[4] = {0, 0, 0, 0};
  std::size_t count = 1;
  for (; i < text.size(); ++i) {
    const char16_t c = text[i];
    if (IsDigit(c)) {
      if (!AppendDigit(fields[count - 1], c)) return kUnreadable;
    } else if (IsSeparator(c) && !frameDisplay && count < 4) {
      ++count;
    } else {
      return kUnreadable;
    }
  }

  if (count == 1 && (frameDisplay || rawCount)) {
    return MoveToExclusiveEnd(Negate(TimeOfCount(fields[0], rate), negative), rate, inclusive);
  }

  std::uint64_t hours = 0, minutes = 0, seconds = 0, frames = 0;
  if (count == 1) {
    // Split a digit run from the right: the frame digits, then two digits each
    // of seconds, minutes and hours.
    const std::uint64_t f = DisplayFramesPerSecond(display, rate);
    std::uint64_t b = 1;
    while (b < f) b *= 10;
    const auto value = static_cast<std::uint64_t>(fields[0]);
    frames = value % b;
    const std::uint64_t r = value / b;
    seconds = r % 100;
    minutes = (r / 100) % 100;
    hours = r / 10000;
  } else {
    const auto field = [&](std::size_t fromRight) {
      return fromRight < count ? static_cast<std::uint64_t>(fields[count - 1 - fromRight]) : 0;
    };
    frames = field(0);
    seconds = field(1);
    minutes = field(2);
    hours = field(3);
  }
  return MoveToExclusiveEnd(FieldsToTime(hours, minutes, seconds, frames, negative, rate, display),
                            rate, inclusive);
}

// One part of a film text read the way a stream reads a signed integer: blanks
// skipped, an optional sign, digits up to the first non-digit. A part without
// digits is 0. False on overflow.
bool ReadFilmPart(std::u16string_view part, std::int64_t& value, bool& hadDigits) noexcept {
  value = 0;
  std::size_t i = 0;
  while (i < part.size() && (part[i] == u' ' || (part[i] >= u'\t' && part[i] <= u'\r'))) ++i;
  bool negative = false;
  if (i < part.size() && (part[i] == u'-' || part[i] == u'+')) negative = part[i++] == u'-';
  std::int64_t magnitude = 0;
  const std::size_t first = i;
  for (; i < part.size() && IsDigit(part[i]); ++i) {
    if (!AppendDigit(magnitude, part[i])) return false;
  }
  if (i == first) return true;  // a failed read gives 0
  hadDigits = true;
  value = negative ? -magnitude : magnitude;
  return true;
}

Reading ReadFilm(std::u16string_view text, FrameRate rate, TimeDisplay display, bool inclusive) {
  bool negative = false;
  if (text.front() == u'-') {
    negative = true;
    text.remove_prefix(1);
  } else if (text.front() == u'+') {
    text.remove_prefix(1);
  }
  std::size_t separator = std::u16string_view::npos;
  for (std::size_t i = 0; i < text.size(); ++i) {
    if (IsSeparator(text[i]) || text[i] == u'+') {
      if (separator != std::u16string_view::npos) return kUnreadable;
      separator = i;
    }
  }
  std::u16string_view feetText, framesText;
  if (separator != std::u16string_view::npos) {
    feetText = text.substr(0, separator);
    framesText = text.substr(separator + 1);
  } else if (text.size() > 2) {
    feetText = text.substr(0, text.size() - 2);
    framesText = text.substr(text.size() - 2);
  } else {
    framesText = text;
  }
  std::int64_t feet = 0, frames = 0;
  bool hadDigits = false;
  if (!ReadFilmPart(feetText, feet, hadDigits) || !ReadFilmPart(framesText, frames, hadDigits) ||
      !hadDigits) {
    return kUnreadable;
  }
  std::int64_t count = 0;
  if (__builtin_mul_overflow(feet, FramesPerFoot(display), &count) ||
      __builtin_add_overflow(count, frames, &count)) {
    return kUnreadable;
  }
  return MoveToExclusiveEnd(Negate(TimeOfCount(count, rate), negative), rate, inclusive);
}

}  // namespace

zebcore::UTF16String TimeToTimecode(TickTime time, FrameRate rate, TimeDisplay display,
                                    zebcore::utility::Flags<unsigned int> flags) {
  display = ResolveDisplay(display, rate);
  std::int64_t ticks = time.GetTicks();
  if (flags.IsSet(kTimecodeFlag_InclusiveEnd) && rate.IsValid()) {
    ticks = static_cast<std::int64_t>(static_cast<std::uint64_t>(ticks) -
                                      static_cast<std::uint64_t>(rate.GetTicksPerFrame()));
  }
  const bool frameDisplay = display.GetType() == kTimeDisplay_Frames;
  const bool filmDisplay = IsFilmDisplay(display);

  TextBuffer text;
  if (flags.IsSet(kTimecodeFlag_ShowSign)) {
    if (ticks > 0) {
      text.Put('+');
    } else if (ticks < 0 && !frameDisplay && !filmDisplay) {
      text.Put('-');
    }
  }
  if (frameDisplay) {
    text.PutSigned(FrameCount(ticks, rate));
  } else if (filmDisplay) {
    const std::int64_t c = FrameCount(ticks, rate);
    const std::int64_t perFoot = FramesPerFoot(display);
    if (ticks < 0) text.Put('-');
    text.PutUnsigned(Magnitude(c / perFoot));
    text.Put('+');
    text.PutUnsigned(Magnitude(c % perFoot), 2);
  } else {
    FormatHMSF(text, ticks, rate, display, flags);
  }
  return text.ToUTF16();
}

zebcore::UTF16String RatioTimeToTimecode(const boost::rational<std::int64_t>& time, FrameRate rate,
                                         TimeDisplay display,
                                         zebcore::utility::Flags<unsigned int> flags) {
  return TimeToTimecode(RatioTimeToTime(time), rate, display, flags);
}

void TimeToHMSF(unsigned& hours, unsigned& minutes, unsigned& seconds, std::uint64_t& frames,
                bool& negative, TickTime time, FrameRate rate, TimeDisplay display) {
  display = ResolveDisplay(display, rate);
  hours = minutes = seconds = 0;
  frames = 0;
  negative = time.GetTicks() < 0;
  if (display.GetType() == kTimeDisplay_Frames) {
    frames = static_cast<std::uint64_t>(time.ToFrame64(rate));
    return;
  }
  const Fields f = ComputeFields(time.GetTicks(), rate, display);
  hours = static_cast<unsigned>(f.hours);
  minutes = static_cast<unsigned>(f.minutes);
  seconds = static_cast<unsigned>(f.seconds);
  frames = f.frames;
  negative = f.negative;
}

std::optional<TickTime> TryTimecodeToTime(std::u16string_view text, FrameRate rate,
                                          TimeDisplay display,
                                          zebcore::utility::Flags<unsigned int> flags) {
  if (text.empty()) return kTime_Zero;
  display = ResolveDisplay(display, rate);
  const bool inclusive = flags.IsSet(kTimecodeFlag_InclusiveEnd);
  const Reading r = IsFilmDisplay(display) ? ReadFilm(text, rate, display, inclusive)
                                           : ReadHMSF(text, rate, display, inclusive);
  if (!r.ok) return std::nullopt;
  return TickTime(r.ticks);
}

std::optional<TickTime> TryTimecodeToTime(std::string_view text, FrameRate rate,
                                          TimeDisplay display,
                                          zebcore::utility::Flags<unsigned int> flags) {
  return TryTimecodeToTime(zebcore::string::View(zebcore::string::UTF8to16(text)), rate, display,
                           flags);
}

TickTime TimecodeToTime(std::u16string_view text, FrameRate rate, TimeDisplay display,
                        zebcore::utility::Flags<unsigned int> flags) {
  return TryTimecodeToTime(text, rate, display, flags).value_or(kTime_Invalid);
}

TickTime TimecodeToTime(std::string_view text, FrameRate rate, TimeDisplay display,
                        zebcore::utility::Flags<unsigned int> flags) {
  return TryTimecodeToTime(text, rate, display, flags).value_or(kTime_Invalid);
}

boost::rational<std::int64_t> TimecodeToRatioTime(std::u16string_view text, FrameRate rate,
                                                  TimeDisplay display,
                                                  zebcore::utility::Flags<unsigned int> flags) {
  return TimeToRatioTime(TimecodeToTime(text, rate, display, flags));
}

TickTime HMSFToTime(unsigned hours, unsigned minutes, unsigned seconds, std::uint64_t frames,
                    bool negative, FrameRate rate, TimeDisplay display) {
  const Reading r = FieldsToTime(hours, minutes, seconds, frames, negative, rate, display);
  return r.ok ? TickTime(r.ticks) : kTime_Invalid;
}

}  // namespace zebmediatypes
