#include "visits/visit.hpp"

#include <algorithm>
#include <charconv>
#include <optional>
#include <span>

#include "visits/words.hpp"

namespace quabble {
namespace {

using Words = std::span<const std::string_view>;

template <typename Number>
std::optional<Number> numberOf(std::string_view word) {
    Number number{};
    const std::span<const char> letters(word);
    const char* end = letters.data() + letters.size();
    const auto [next, problem] = std::from_chars(letters.data(), end, number);
    return problem == std::errc() && next == end && !word.empty() ? std::optional(number) : std::nullopt;
}

// "2s", "2100ms" or "2100000us".
std::optional<microseconds> timeOf(std::string_view word) {
    const std::size_t digits = std::min(word.find_first_not_of("0123456789"), word.size());
    const auto number = numberOf<std::uint32_t>(word.substr(0, digits));
    const std::string_view unit = word.substr(digits);
    if (!number)
        return std::nullopt;
    const std::int64_t count = *number;
    if (unit == "s")
        return microseconds(1'000'000 * count);
    if (unit == "ms")
        return microseconds(1'000 * count);
    return unit == "us" ? std::optional(microseconds(count)) : std::nullopt;
}

// The two coordinates of a mouse event and the words after them.
bool readMouse(InputEvent& event, Words words) {
    if (words.size() < 2)
        return false;
    const auto x = numberOf<std::int16_t>(words[0]), y = numberOf<std::int16_t>(words[1]);
    if (!x || !y)
        return false;
    event.x = *x;
    event.y = *y;
    for (const std::string_view word : words.subspan(2)) {
        if (word != "shift" && word != "again")
            return false;
        (word == "shift" ? event.extends : event.continuesClick) = true;
    }
    return true;
}

// What comes after the word of the event's kind.
bool readRest(InputEvent& event, Words words) {
    switch (event.kind) {
        case EventKind::MouseDown:
        case EventKind::MouseMove:
        case EventKind::MouseUp:
            return readMouse(event, words);
        case EventKind::KeyPress: {
            const auto key = words.size() == 1 ? keyOf(words[0]) : std::nullopt;
            event.key = key.value_or(0);
            return key.has_value();
        }
        case EventKind::Edit: {
            const auto command = words.empty() ? std::nullopt : editCommandOf(words[0]);
            event.command = command.value_or(EditCommand::Left);
            event.extends = words.size() == 2 && words[1] == "shift";
            return command && (words.size() == 1 || event.extends);
        }
        case EventKind::Rescaled: {
            const auto scale = words.size() == 1 ? scaleOf(words[0]) : std::nullopt;
            event.scale = scale.value_or(Scale());
            return scale.has_value();
        }
        case EventKind::TextInput:
            return !event.text.empty();
        case EventKind::CloseButton:
        case EventKind::Minimised:
        case EventKind::Restored:
            return words.empty();
    }
    return false;
}

// Reads a visit line by line; the first problem is the last one.
class Reader {
 public:
    std::variant<Visit, VisitProblem> read(std::string_view text) {
        while (!text.empty() && !problem_) {
            const std::size_t end = std::min(text.find('\n'), text.size());
            std::string_view line = text.substr(0, end);
            text.remove_prefix(std::min(end + 1, text.size()));
            if (line.ends_with('\r'))
                line.remove_suffix(1);
            ++line_;
            const auto words = wordsIn(line);
            if (!words.empty() && !words[0].starts_with('#'))
                readLine(line, words);
        }
        if (!problem_ && !hasBegun_)
            fail("a visit begins with \"visit 1\"");
        if (problem_)
            return *problem_;
        return std::move(visit_);
    }

 private:
    void fail(std::string what) { problem_ = VisitProblem{line_, std::move(what)}; }

    void readLine(std::string_view line, Words words) {
        const std::string_view first = words[0];
        if (!hasBegun_) {
            hasBegun_ = words.size() == 2 && first == "visit" && words[1] == "1";
            if (!hasBegun_)
                fail("a visit begins with \"visit 1\"");
        } else if (first == "at") {
            readAct(line, words.subspan(1));
        } else if (first == "expect") {
            readExpectation(line, words.subspan(1));
        } else if (!readStart(words)) {
            fail("not understood");
        }
    }

    bool readStart(Words words) {
        if (!visit_.steps.empty() || words.size() < 2)
            return false;
        if (words[0] == "scores")
            return readScores(words.subspan(1));
        if (words[0] == "wakes")
            return visit_.areWakesWritten = words.size() == 3 && words[1] == "as" && words[2] == "written";
        if (words.size() != 2)
            return false;
        if (words[0] == "store")
            return visit_.isStoreDamaged = words[1] == "damaged";
        if (words[0] == "scale") {
            const auto scale = scaleOf(words[1]);
            visit_.scale = scale.value_or(Scale());
            return scale.has_value();
        }
        const auto number = numberOf<std::uint64_t>(words[1]);
        if (words[0] == "seed" && number)
            visit_.seed = *number;
        else if (words[0] == "drawn" && number && *number <= mostDrawn)
            visit_.drawn = *number;
        else
            return false;
        return true;
    }

    // "scores 2 900 40": a table's scores, best first; those left out are 0.
    bool readScores(Words words) {
        const auto table = numberOf<std::size_t>(words[0]);
        if (!table || *table < 1 || *table > visit_.scores.size() || words.size() > highScorePlaces + 1U)
            return false;
        for (std::size_t i = 1; i < words.size(); ++i) {
            const auto score = numberOf<std::int32_t>(words[i]);
            if (!score)
                return false;
            visit_.scores[*table - 1][i - 1] = *score;
        }
        return true;
    }

    void readAct(std::string_view line, Words words) {
        const auto time = words.empty() ? std::nullopt : timeOf(words[0]);
        if (!time || *time < time_) {
            fail(time ? "time does not go back" : "a time is missing, as in \"at 2100ms\"");
            return;
        }
        time_ = *time;
        words = words.subspan(1);
        VisitStep step{.line = line_, .at = time_};
        if (words.empty())
            visit_.steps.push_back(step);
        else if (words.size() == 1 && words[0] == "end")
            visit_.steps.emplace_back(step).kind = VisitStep::Kind::End;
        else if (words.size() == 3 && words[0] == "given")
            readGiven(step, words.subspan(1));
        else
            readEvent(step, line, words);
    }

    void readGiven(VisitStep step, Words words) {
        const bool isBoard = words[0] == givens::board;
        const bool isNumber = words[0] == givens::level || words[0] == givens::rows;
        if (isBoard ? !isBoardText(words[1]) : !isNumber || !numberOf<std::uint16_t>(words[1])) {
            fail("not understood");
            return;
        }
        step.kind = VisitStep::Kind::Given;
        step.what = words[0];
        step.value = words[1];
        visit_.steps.push_back(step);
    }

    // At most 16 rows of 12 letters.
    static bool isBoardText(std::string_view text) {
        std::size_t column = 0;
        for (const char letter : text) {
            column = letter == '/' ? 0 : column + 1;
            if (column > 12 || (letter != '/' && boardLetters.find(letter) == std::string_view::npos))
                return false;
        }
        return std::ranges::count(text, '/') < 16;
    }

    void readEvent(VisitStep step, std::string_view line, Words words) {
        step.kind = VisitStep::Kind::Event;
        const bool isClick = words[0] == "click";
        const auto kind = isClick ? EventKind::MouseDown : eventKindOf(words[0]);
        step.isBelow = kind != EventKind::TextInput && words.back() == "below";
        if (step.isBelow)
            words = words.first(words.size() - 1);
        step.event.kind = kind.value_or(EventKind::MouseMove);
        if (kind == EventKind::TextInput && words.size() > 1)
            step.event.text = restOf(line, words[1]);
        if (!kind || !readRest(step.event, words.subspan(1))) {
            fail("not understood");
            return;
        }
        visit_.steps.push_back(step);
        if (isClick)
            visit_.steps.emplace_back(step).event.kind = EventKind::MouseUp;
    }

    // The line from one of its words on.
    static std::string_view restOf(std::string_view line, std::string_view word) {
        return line.substr(static_cast<std::size_t>(word.data() - line.data()));
    }

    void readExpectation(std::string_view line, Words words) {
        using namespace expectations;
        constexpr std::string_view known[] = {picture, window, score, level, rows, ended};
        if (words.empty() || std::ranges::find(known, words[0]) == std::end(known)) {
            fail("not understood");
            return;
        }
        VisitStep step{
            .kind = VisitStep::Kind::Expect, .line = line_, .at = time_, .what = std::string(words[0])};
        if (words.size() > 1)
            step.value = restOf(line, words[1]);
        visit_.steps.push_back(step);
    }

    static constexpr std::uint64_t mostDrawn = 100'000'000;  // which takes a second to draw again

    Visit visit_;
    std::size_t line_ = 0;
    microseconds time_{0};
    bool hasBegun_ = false;
    std::optional<VisitProblem> problem_;
};

}  // namespace

std::variant<Visit, VisitProblem> parseVisit(std::string_view text) {
    return Reader().read(text);
}

std::vector<std::string_view> wordsIn(std::string_view line) {
    std::vector<std::string_view> words;
    while (true) {
        line.remove_prefix(std::min(line.find_first_not_of(' '), line.size()));
        if (line.empty())
            return words;
        const std::size_t end = std::min(line.find(' '), line.size());
        words.push_back(line.substr(0, end));
        line.remove_prefix(end);
    }
}

}  // namespace quabble
