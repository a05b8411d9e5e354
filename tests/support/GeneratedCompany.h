#pragma once

#include "support/Engines.h"
#include "support/MemoryCompany.h"

#include <map>
#include <memory>

namespace pelmar::test {

// One generated company (700 cards) shared by the tests of a program: in memory, to work out
// independently what a statement must return, and as database "selection" on each engine, made
// once per engine.
inline CompanyOptions generatedCompanyOptions()
{
    CompanyOptions options;
    options.seed = 11;
    options.cards = 700;
    return options;
}

inline const MemoryCompany& generatedCompany()
{
    static const MemoryCompany memory(generatedCompanyOptions());
    return memory;
}

inline Engine& generatedCompanyEngine(EngineFactory factory)
{
    static std::map<EngineFactory, std::unique_ptr<Engine>> engines;
    auto& engine = engines[factory];
    if (!engine) {
        engine = factory();
        engine->createCompany(QStringLiteral("selection"), generatedCompanyOptions());
    }
    return *engine;
}

}  // namespace pelmar::test
