#pragma once

#include "outputs/Services.h"

#include <QList>
#include <QString>

#include <functional>
#include <optional>

namespace pelmar {

class ProgressSink;
struct MailingOptions;
struct SessionState;

// The stop flag as a run sees it. A run that honours it asks between recipients: the user
// interface first gets to handle what is pending (the stop button among it), then the flag is
// read. The flag itself lives in the session, where the stop button sets it.
class StopToken {
public:
    explicit StopToken(bool& flag, std::function<void()> yield = {}) : flag_(flag), yield_(std::move(yield)) {}

    bool requested()
    {
        if (yield_)
            yield_();
        return flag_;
    }
    // A run's own error path stops it as the stop button would.
    void request() { flag_ = true; }

private:
    bool& flag_;
    std::function<void()> yield_;
};

// What a caller hands a run besides the options: a file to write instead of the output's own
// (empty: the output's fixed name in the temporary folder), the list kind of the recipient list,
// the card of the card page.
struct RunRequest {
    QString outputPath;
    std::optional<short> kind;
    QString cardCode;
};

// Everything one run works with. The options are a copy taken when the run started; the session
// is the process-wide state the run reads (hand-picked cards, groups, properties, label styles)
// and writes (the schema level).
struct RunContext {
    const MailingOptions& options;
    SessionState& state;
    Services services;
    ProgressSink& progress;
    StopToken& stop;
    RunRequest request;
    // What the run adds to its finish message (how many it sent, how many it dropped); empty
    // for nothing.
    QString outcome{};
};

// What the command line needs to know to run an output.
struct CommandLineUse {
    enum class Argument { None, CardCode, Kind };

    QString synopsis;  // "list [--kind 2..6] [-o FILE] [--open]"
    QString summary;  // one line for --help
    Argument argument = Argument::None;
    bool fileRequired = false;  // -o FILE must be given: the output asks for its file
};

// What the program shows of an output before it runs it.
struct OutputDescription {
    // The command that runs it on the command line; empty for one that has none.
    QString name{};
    // The output kind (2..6) by which cmbOutType chooses it (list position + 2); 0 for an output
    // that the list does not offer.
    short kind = 0;
    // The question the run button asks before starting it, and the message shown when its run
    // returns (also after a stop); empty for none.
    QString question{};
    QString finishMessage{};
    CommandLineUse commandLine{};
};

// One output of the program: the label sheet, the recipient list, the SMS list, the card page,
// and (through the run button) letters, faxes and e-mail.
class Output {
public:
    explicit Output(OutputDescription description) : description_(std::move(description)) {}
    virtual ~Output() = default;

    const QString& name() const { return description_.name; }
    short kind() const { return description_.kind; }
    const QString& question() const { return description_.question; }
    const QString& finishMessage() const { return description_.finishMessage; }
    const CommandLineUse& commandLine() const { return description_.commandLine; }

    // Runs the output. Throws Failure with the description the user is shown; what was written
    // before the failure stays.
    virtual void run(RunContext& context) const = 0;

private:
    OutputDescription description_;
};

// The message shown when the output's run returns: its finish message and the run's outcome on
// a line of its own; empty for an output that has none.
QString finishText(const Output& output, const RunContext& context);

// Every output, those the run button offers first, in the order of cmbOutType.
const QList<const Output*>& outputTable();

// The output kind a position of cmbOutType chooses: the position + 2, where nothing chosen (-1)
// counts as the first entry.
short chosenOutputKind(int listIndex);

// The output the run button starts for a position of cmbOutType.
const Output& outputChosenAt(int listIndex);

// The output a command names; null when none does.
const Output* outputNamed(const QString& name);

}  // namespace pelmar
