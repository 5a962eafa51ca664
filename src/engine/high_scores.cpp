#include "engine/high_scores.hpp"

#include <algorithm>
#include <cassert>
#include <utility>

namespace quabble {

const HighScoreTable& HighScores::table(std::int16_t tableIndex) const {
    assert(tableIndex >= 1 && tableIndex <= highScoreTables);
    return tables_[static_cast<std::size_t>(tableIndex - 1)];
}

HighScoreTable& HighScores::table(std::int16_t tableIndex) {
    return const_cast<HighScoreTable&>(std::as_const(*this).table(tableIndex));
}

std::int16_t HighScores::rankOf(std::int16_t tableIndex, std::int32_t score) const {
    const auto& scores = table(tableIndex).scores;
    const auto place = std::ranges::find_if(scores, [&](std::int32_t held) { return held < score; });
    return static_cast<std::int16_t>(place - scores.begin() + 1);
}

void HighScores::insertHighScore(std::int16_t tableIndex, std::int32_t score, std::string name) {
    const std::int16_t rank = std::min(rankOf(tableIndex, score), highScorePlaces);
    HighScoreTable& record = table(tableIndex);
    std::move_backward(record.scores.begin() + rank - 1, record.scores.end() - 1, record.scores.end());
    std::move_backward(record.names.begin() + rank - 1, record.names.end() - 1, record.names.end());
    record.scores[static_cast<std::size_t>(rank - 1)] = score;
    record.names[static_cast<std::size_t>(rank - 1)] = std::move(name);
}

}  // namespace quabble
