#include "Filters/MeasurementTape.h"

#include <QList>

#include <algorithm>

namespace orvela {

namespace {

bool writes(const char* task, const StatisticField& field) {
    const QByteArrayList writers = QByteArray(field.writer).split(',');
    return std::any_of(writers.begin(), writers.end(),
                       [task](const QByteArray& writer) { return writer.trimmed() == task; });
}

} // namespace

void MeasurementTape::moveTo(int step, const char* task) {
    mPlace = {step, 0};
    mTask = task;
}

void MeasurementTape::record(const CUserParams& found) {
    CUserParams& kept = mFound.insert_or_assign(mPlace, found).first->second;
    kept.mProgressCallback = nullptr;
    ++mPlace.second;
}

bool MeasurementTape::play(CUserParams& params) {
    const auto found = mFound.find(mPlace);
    if (found == mFound.end()) {
        mMissed = true;
        return false;
    }
    ++mPlace.second;
    params.pHisto_Luma = found->second.pHisto_Luma;
    params.pHisto_Red = found->second.pHisto_Red;
    params.pHisto_Green = found->second.pHisto_Green;
    params.pHisto_Blue = found->second.pHisto_Blue;
    for (const StatisticField& field : statisticFields())
        if (writes(mTask, field))
            field.setIn(params, field.valueIn(found->second));
    return true;
}

void MeasurementTape::record(std::span<const float> numbers) {
    mNumbers.insert_or_assign(mPlace, std::vector(numbers.begin(), numbers.end()));
    ++mPlace.second;
}

bool MeasurementTape::play(std::span<float> numbers) {
    const auto found = mNumbers.find(mPlace);
    if (found == mNumbers.end()) {
        mMissed = true;
        return false;
    }
    ++mPlace.second;
    std::copy(found->second.begin(), found->second.end(), numbers.begin());
    return true;
}

} // namespace orvela
