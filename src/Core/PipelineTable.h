#pragma once

#include "Filters/TaskBase.h"

#include <memory>
#include <span>
#include <vector>

namespace orvela {

enum class TaskKind { Filter, Histogram, Analyzer };

/// One task of a pipeline: how to make it, and what surrounds its run.
struct PipelineTask {
    const char* name; ///< class name
    TaskKind kind;
    std::unique_ptr<TaskBase> (*make)(const RunContext& context, CUserParams* params, CARGBPlane* inPlane,
                                      CARGBPlane* outPlane);
    bool (*condition)(const CUserParams& params) = nullptr; ///< whether to run it at all; null: always
    void (*afterwards)(CUserParams& params) = nullptr;      ///< what follows it, run or not
};

/// One announced step and the tasks run under it, in order.
struct PipelineStep {
    const char* label; ///< as announced and logged
    const char* title; ///< the same for people, marked for translation in the context "PipelineTable"
    std::vector<PipelineTask> tasks;
    bool (*announced)(const CUserParams& params) = nullptr; ///< null: always
    const char* logBefore = nullptr;                        ///< debug line before the announcement
    const char* logAfter = nullptr;                         ///< debug line after the tasks
};

namespace PipelineTable {

/// The main pipeline, 36 announced steps.
std::span<const PipelineStep> mainSteps();

/// The final-touch pipeline, which announces nothing.
std::span<const PipelineTask> finalTouchTasks();

/// Every task of both pipelines once, in order of first use: the registry for walkers over all tasks.
std::vector<PipelineTask> allTasks();

} // namespace PipelineTable

} // namespace orvela
