// Makes one small change at a time in a copy of the program and counts those that a test notices: see run.
#include <algorithm>
#include <array>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <map>
#include <regex>
#include <string>
#include <utility>
#include <vector>

namespace {

constexpr double goal = 0.92;
constexpr const char* timeLimit = "timeout -k 1 30 ";

constexpr const char* visits = "quabble-visit";

// The test programs that see the code of a folder, the quickest tests first, each with a filter.
using Tests = std::vector<std::pair<std::string, std::string>>;
const std::map<std::string, Tests> testsOf{
    {"engine", {{"engine_tests", "-Rules*"}, {"engine_tests", "*"}, {visits, ""}, {"app_tests", "*"}}},
    {"app", {{visits, ""}, {"app_tests", "*"}}},
    {"registry", {{"registry_tests", "*"}, {"store_tests", "*"}}},
    {"store", {{"store_tests", "*"}, {visits, ""}, {"app_tests", "*"}, {"hosts_desktop_tests", "*"}}},
    {"hosts", {{"hosts_desktop_tests", "-Crash*"}, {"hosts_desktop_tests", "Crash*"}}},
};

struct Mutation {
    std::size_t at;
    std::size_t length;
    std::string text;
};

enum Verdict : std::size_t { Killed, Equivalent, Survived, DoesNotCompile };
using Tally = std::array<int, 4>;

// The part of the changes that was noticed, of those that compile.
double ratioOf(const Tally& tally) {
    return 1.0 * tally[Killed] / std::max(1, tally[Killed] + tally[Equivalent] + tally[Survived]);
}

void print(const std::string& title, const Tally& tally) {
    std::printf("%-35s %4d killed, %5.1f %%; %2d equivalent, %2d survived; %2d do not compile\n",
                title.c_str(), tally[Killed], 100 * ratioOf(tally), tally[Equivalent], tally[Survived],
                tally[DoesNotCompile]);
}

template <typename Visit>
void forEachMatch(const std::string& text, const char* pattern, Visit visit) {
    const std::regex regex(pattern);
    for (std::sregex_iterator match(text.begin(), text.end(), regex), end; match != end; ++match)
        visit(*match, [&](std::size_t group) { return static_cast<std::size_t>(match->position(group)); });
}

// The place behind the bracket that closes the one at `open`.
std::size_t behindBrackets(const std::string& code, std::size_t open) {
    int depth = 0;
    for (std::size_t i = open; i < code.size(); ++i) {
        depth += code[i] == '(' ? 1 : code[i] == ')' ? -1 : 0;
        if (depth == 0)
            return i + 1;
    }
    return code.size();
}

// The text with everything blanked, byte for byte, that is no code to change.
std::string codeAlone(const std::string& text) {
    std::string code = text;
    const auto blank = [&](std::size_t begin, std::size_t end) {
        for (std::size_t i = begin; i < end; ++i)
            code[i] = code[i] == '\n' ? '\n' : '"';
    };
    forEachMatch(text, R"re(R"\([\s\S]*?\)"|"(\\.|[^"\\])*"|//[^\n]*|\B'(\\.|[^'\\])'|\n#[^\n]*)re",
                 [&](const auto& match, auto at) { blank(at(0), at(0) + match.str().size()); });
    forEachMatch(std::string(code), R"(\bassert(\())",
                 [&](const auto&, auto at) { blank(at(0), behindBrackets(code, at(1))); });
    return code;
}

// Operators are told from template brackets and the like by the layout: they have a space on each side.
std::vector<Mutation> mutationsOf(const std::string& text) {
    const std::string code = codeAlone(text);
    std::vector<Mutation> found;
    const std::map<std::string, std::string> exchanged{
        {"==", "!="}, {"!=", "=="}, {"<", "<="},  {"<=", "<"},  {">", ">="},       {">=", ">"},
        {"+", "-"},   {"-", "+"},   {"*", "/"},   {"/", "*"},   {"&&", "||"},      {"||", "&&"},
        {"+=", "-="}, {"-=", "+="}, {"++", "--"}, {"--", "++"}, {"true", "false"}, {"false", "true"}};
    forEachMatch(code, R"( (==|!=|<=?|>=?|[-+*/]|&&|\|\||\+=|-=)(?=\s)|(\+\+|--)|\b(true|false)\b)",
                 [&](const auto& match, auto at) {
                     const std::size_t group = match[1].matched ? 1 : match[2].matched ? 2 : 3;
                     found.push_back({at(group), match.str(group).size(), exchanged.at(match.str(group))});
                 });
    forEachMatch(code, R"(!(?=[\w(*]))", [&](const auto&, auto at) { found.push_back({at(0), 1, ""}); });
    forEachMatch(code, R"((^|[^\w.'])(\d+)(?=ms\b|\.\d|'\d|[^\w.']))", [&](const auto& match, auto at) {
        found.push_back({at(2), match.str(2).size(), std::to_string(std::stol(match.str(2)) + 1)});
        if (match.str(2) == "1")
            found.push_back({at(2), 1, "0"});
    });
    // A condition is not negated as a whole where another change comes to the same.
    forEachMatch(code, R"(\b(?:if|while) (\())", [&](const auto&, auto at) {
        const std::size_t end = behindBrackets(code, at(1)) - 1;
        const std::size_t semicolon = code.find_last_of(";{", end);
        const std::size_t begin = semicolon > at(1) ? semicolon + 2 : at(1) + 1;
        const std::string condition = code.substr(begin, end - begin);
        if (std::regex_search(condition, std::regex(R"(&&|\|\|)")) ||
            !std::regex_search(condition, std::regex("^!|[!=]= ")))
            found.push_back({begin, end - begin, "!(" + text.substr(begin, end - begin) + ")"});
    });
    // A statement that is a call, or a chain of calls.
    forEachMatch(code, R"re(([;{})"\n]|else)\n +((co_await )?(?!if|while|for|switch|return)[\w:.>-]+(\()))re",
                 [&](const auto&, auto at) {
                     std::size_t end = behindBrackets(code, at(4));
                     while (code[end] == '.' && code.find('(', end) < code.find_first_of("=;", end))
                         end = behindBrackets(code, code.find('(', end));
                     if (code[end] == ';')
                         found.push_back({at(2), end - at(2), ""});
                 });
    return found;
}

// Runs a command silently; true when it ended well.
bool run(const std::string& command) {
    return std::system((command + " >/dev/null 2>&1").c_str()) == 0;
}

// A test that crashes, does not end or eats the memory notices the change as well.
Verdict judge(const std::string& build, const Tests& tests) {
    for (const auto& [program, filter] : tests) {
        if (!run("cmake --build " + build + " -j2 --target " + program))
            return DoesNotCompile;
        const std::string words = program == visits
                                      ? " --files " + build + "/bin " + build + "/../tests/visits/*.visit"
                                      : " --gtest_fail_fast '--gtest_filter=" + filter + "'";
        if (!run(timeLimit + build + "/bin/" + program + words))
            return Killed;
    }
    return Survived;
}

std::string contents(const std::filesystem::path& file) {
    std::ifstream in(file, std::ios::binary);
    return {std::istreambuf_iterator<char>(in), {}};
}

// The whole lines of a part of a text, as one line without its indentation.
std::string linesOf(const std::string& text, std::size_t at, std::size_t length) {
    const std::size_t begin = text.rfind('\n', at) + 1;
    const std::string lines = text.substr(begin, text.find('\n', at + length) - begin);
    return std::regex_replace(std::regex_replace(lines, std::regex(R"(\n\s*)"), " "), std::regex(R"(^\s+)"),
                              "");
}

}  // namespace

// mutate COPY EQUIVALENT FILE... changes files in the copy, which lies built in COPY/build. EQUIVALENT holds
// four lines for every change that no test can notice: file, line before, line after, reason. What was killed
// once is noted in COPY/killed and not tried again.
int main(int argc, char** argv) {
    if (argc < 4)
        return EXIT_FAILURE;
    const std::filesystem::path copy = argv[1];
    const std::string known = contents(argv[2]);
    const std::string killedBefore = "\n" + contents(copy / "killed");
    std::ofstream killed(copy / "killed", std::ios::app);
    Tally total{};
    for (const std::string& file : std::vector<std::string>(argv + 3, argv + argc)) {
        const std::string text = contents(copy / file);
        const Tests& tests = testsOf.at(file.substr(4, file.find('/', 4) - 4));
        Tally tally{};
        std::map<std::string, int> times;
        for (const auto& [at, length, replacement] : mutationsOf(text)) {
            const std::string mutant = std::string(text).replace(at, length, replacement);
            const std::string before = linesOf(text, at, length);
            const std::string after = linesOf(mutant, at, replacement.size());
            std::string change = file + " " + before + " -> " + after;
            change += " " + std::to_string(++times[change]);  // the same change of another such line
            Verdict verdict = Killed;
            if (killedBefore.find("\n" + change + "\n") == std::string::npos) {
                std::ofstream(copy / file, std::ios::binary) << mutant;
                verdict = judge((copy / "build").string(), tests);
                if (verdict == Killed)
                    killed << change << std::endl;
            }
            if (verdict == Survived &&
                known.find(file + "\n" + before + "\n" + after + "\n") != std::string::npos)
                verdict = Equivalent;
            if (verdict == Survived)
                std::printf("%s:%td: %s -> %s\n", file.c_str(),
                            std::count(text.data(), text.data() + at, '\n') + 1, before.c_str(),
                            after.c_str());
            ++tally[verdict];
            std::fflush(stdout);
        }
        std::ofstream(copy / file, std::ios::binary) << text;
        print(file, tally);
        for (std::size_t i = 0; i < total.size(); ++i)
            total[i] += tally[i];
    }
    print("all", total);
    return ratioOf(total) >= goal ? EXIT_SUCCESS : EXIT_FAILURE;
}
