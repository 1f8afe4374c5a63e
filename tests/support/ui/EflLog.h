#pragma once

#include <string>
#include <vector>

namespace test_ui {

/// EFL's own error and critical lines while this object lives. One that no test expected fails the test.
class EflLog {
public:
    /// To be made when EFL has started and destroyed before it ends.
    EflLog();
    /// Fails the test for every line that was not expected, and for every expected one that did not come.
    ~EflLog();
    EflLog(const EflLog&) = delete;
    EflLog& operator=(const EflLog&) = delete;

    /// Lines that hold `text` are meant to come, at least one.
    void expect(const std::string& text);
    /// The lines so far, each "function: message".
    std::vector<std::string> lines() const;

    struct State;

private:
    State* state_;
};

}  // namespace test_ui
