// What the program answers, as a user at a shell sees it: data/transcripts/*.txt. A line "$ COMMAND" runs in
// the transcript's own folder, with the sample photographs in $S and settings of its own; the lines below it
// are what it writes to both outputs, where * stands for any text, and [STATUS] at the end when that is not
// 0.

#include "hosts/TestFiles.h"

#include <QRegularExpression>
#include <QString>

#include <sys/wait.h>

#include <algorithm>
#include <sstream>

using namespace orvela;

namespace {

namespace fs = std::filesystem;

std::vector<fs::path> transcripts() {
    std::vector<fs::path> found;
    for (const auto& entry : fs::directory_iterator(ORVELA_TEST_DATA "/transcripts"))
        found.push_back(entry.path());
    return found;
}

struct Step {
    int line = 0;
    std::string command;
    std::vector<std::string> answer;
};

std::vector<Step> stepsOf(const fs::path& file) {
    std::ifstream stream(file);
    std::vector<Step> steps;
    int number = 0;
    for (std::string line; std::getline(stream, line);) {
        ++number;
        if (line.starts_with("$ "))
            steps.push_back({number, line.substr(2), {}});
        else if (!line.empty() && line[0] != '#')
            steps.at(steps.size() - 1).answer.push_back(line);
    }
    return steps;
}

std::vector<std::string> answerTo(const std::string& command, const TestFolder& home, const TestFolder& log) {
    std::ostringstream script;
    script << "cd '" << home.path().string() << "' && { " << command << "\n} >'" << (log / "out").string()
           << "' 2>&1";
    const int status = std::system(script.str().c_str());
    std::istringstream text(log.text("out"));
    std::vector<std::string> lines;
    for (std::string line; std::getline(text, line);)
        lines.push_back(line);
    if (status != 0)
        lines.push_back(QStringLiteral("[%1]").arg(WEXITSTATUS(status)).toStdString());
    return lines;
}

bool fits(const std::string& line, const std::string& pattern) {
    const QString expression =
        QRegularExpression::escape(QString::fromStdString(pattern)).replace("\\*", ".*");
    return QRegularExpression(QRegularExpression::anchoredPattern(expression))
        .match(QString::fromStdString(line))
        .hasMatch();
}

class Transcript : public testing::TestWithParam<fs::path> {};

TEST_P(Transcript, IsWhatTheProgramAnswers) {
#if defined(__SANITIZE_ADDRESS__)
    if (GetParam().stem() == "large_pictures")
        GTEST_SKIP() << "the sanitizer needs more memory than any limit";
#endif
    const TestFolder home;
    const TestFolder log;
    const QByteArray configuration = qgetenv("XDG_CONFIG_HOME");
    qputenv("XDG_CONFIG_HOME", (log / "config").c_str());
    qputenv("PATH", fs::path(ORVELA_PROGRAM).parent_path().c_str() + (":" + qgetenv("PATH")));
    const std::vector<Step> steps = stepsOf(GetParam());
    ASSERT_FALSE(steps.empty());
    for (const Step& step : steps) {
        const std::vector<std::string> answer = answerTo(step.command, home, log);
        const bool matches =
            std::equal(answer.begin(), answer.end(), step.answer.begin(), step.answer.end(), fits);
        EXPECT_TRUE(matches) << GetParam().filename() << ':' << step.line << " $ " << step.command << "\n"
                             << testing::PrintToString(answer);
    }
    qputenv("XDG_CONFIG_HOME", configuration);
}

INSTANTIATE_TEST_SUITE_P(All, Transcript, testing::ValuesIn(transcripts()),
                         [](const auto& file) { return file.param.stem().string(); });

} // namespace
