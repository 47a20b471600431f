#pragma once

#include "Core/CThreadedCore.h"

/// The main pipeline. Every mode but Final Touch runs it; the modes differ in the parameters only.
class CThreadedCore_Orvela final : public CThreadedCore {
    Q_OBJECT

public:
    using CThreadedCore::CThreadedCore;

protected:
    bool doRun() override;
};
