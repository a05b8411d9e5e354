#include "support/OutputRun.h"

namespace pelmar::test {

void OutputRunTest::SetUp()
{
    Isolated::SetUp();
    store = std::make_unique<SettingsStore>(configFolder());
}

RunContext OutputRunTest::context(const RunRequest& request)
{
    return RunContext{options, state, services(), progress, stop, request};
}

void OutputRunTest::run(const QString& name, const RunRequest& request)
{
    const Output* output = outputNamed(name);
    ASSERT_NE(output, nullptr) << name.toStdString();
    RunContext runContext = context(request);
    output->run(runContext);
}

}  // namespace pelmar::test
