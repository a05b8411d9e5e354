#pragma once

#include "common/SessionState.h"
#include "control/MainCard.h"
#include "db/DatabaseClient.h"
#include "settings/SettingsStore.h"
#include "support/Fakes.h"
#include "support/Isolated.h"

#include <memory>

namespace pelmar::test {

// A mailing control on fakes, with its own settings store and temporary folder.
class MainCardTest : public Isolated {
protected:
    void SetUp() override
    {
        Isolated::SetUp();
        store = std::make_unique<SettingsStore>(configFolder());
        card = makeCard();
    }

    std::unique_ptr<MainCard> makeCard()
    {
        return std::make_unique<MainCard>(Services{messages, browser, files, *store, database}, state);
    }

    const MainCardControls& c() const { return card->controls(); }
    // A control of the pages by its name.
    template <typename Control>
    Control* control(const QString& name) const
    {
        return card->findChild<Control*>(name);
    }

    FakeMessages messages;
    FakeBrowser browser;
    FakeFileDialogs files;
    DatabaseClient database{QStringLiteral("PostgreSQL Unicode")};
    SessionState state;
    std::unique_ptr<SettingsStore> store;
    std::unique_ptr<MainCard> card;
};

}  // namespace pelmar::test
