#pragma once

#include "Core/CThreadedCore.h"

#include <memory>

/// The final-touch pipeline: contrast, colour and levels with the final-touch sliders, always from the image
/// that the core was created with.
class CThreadedCore_FinalTouch final : public CThreadedCore {
    Q_OBJECT

public:
    /// @throws COutOfMemoryEx when the copy of the input plane cannot be made
    CThreadedCore_FinalTouch(CARGBPlane* inPlane, CARGBPlane* outPlane, QObject* parent = nullptr);
    ~CThreadedCore_FinalTouch() override;

protected:
    bool doRun() override;

private:
    std::unique_ptr<CARGBPlane> mOriginalPlane;
};
