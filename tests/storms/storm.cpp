#include "storms/storm.h"

#include "storms/checks.h"
#include "storms/dialogs.h"
#include "storms/failure.h"
#include "storms/library.h"
#include "storms/pictures.h"
#include "storms/stage.h"
#include "storms/stand_ins.h"
#include "storms/words.h"

#include <algorithm>
#include <cstdio>
#include <fstream>

namespace kortest {
namespace {

constexpr int32_t kCallsOfAStep = 3000000;
constexpr size_t kStepsBetweenPictures = 64;
constexpr size_t kStepsBetweenChecksOfAll = 16;
constexpr size_t kWarmUp = 400;  // operations before the balance is taken the first time

struct Balance {
    int blocks;
    int made;
    HandleCounts handles;
    int grids;
    int texts;
};

Balance TakeBalance(const Stage& stage) {
    return {LiveBlocks(), BlocksMade(), LiveHandles(), stage.gridsCreated, stage.textsLeft};
}

// A grid leaves its headers' font behind, a function bar the texts of items deleted one by one.
void CompareBalance(const Stage& stage, const Balance& before) {
    const Balance now = TakeBalance(stage);
    if (stage.hadTwoGrids) return;  // what the first one had is lost, as is said of it
    const int texts = now.texts - before.texts;
    const int blocks = now.blocks - before.blocks;
    if (now.blocks >= 0 && (blocks < 0 || blocks > texts)) {
        FailStorm("leak: %d blocks more than at first: %s", blocks,
                  DescribeLiveBlocks(before.made));
    }
    const int fonts = now.handles.fonts - before.handles.fonts;
    if (fonts > now.grids - before.grids) FailStorm("leak: %d fonts", fonts);
    if (now.handles.objects > before.handles.objects) {
        FailStorm("leak: %d drawing objects", now.handles.objects - before.handles.objects);
    }
    if (now.handles.contexts > before.handles.contexts) {
        FailStorm("leak: %d DCs", now.handles.contexts - before.handles.contexts);
    }
    // A paint that could not begin, as its window was gone, is ended all the same.
    if (now.handles.paintings > before.handles.paintings) FailStorm("leak: a paint without end");
    if (now.handles.menus > before.handles.menus) FailStorm("leak: a menu");
}

void RunSteps(Stage& stage, const Sequence& sequence, size_t first, size_t end) {
    for (size_t i = first; i < end; ++i) {
        progress.step = i;
        AllowImportCalls(kCallsOfAStep);
        stage.forgetTouched();
        stage.run(sequence[i]);
        if (i % kStepsBetweenChecksOfAll == 0) stage.touchAll();
        CheckStage(stage);
        CheckRecords(stage);
        if (i % kStepsBetweenPictures == kStepsBetweenPictures - 1) ComparePictures(stage);
    }
}

bool MakeSequence(const StormPlan& plan, Sequence& sequence) {
    Vocabulary vocabulary;
    if (!VocabularyOf(plan.control, vocabulary)) return false;
    if (!plan.replayed.empty()) {
        std::ifstream file(plan.replayed);
        return file && vocabulary.read(file, sequence);
    }
    RandomSource random(plan.seed);
    for (int i = 0; i < plan.steps; ++i) sequence.push_back(vocabulary.draw(random));
    return true;
}

const char* NameOf(StormHeap heap) { return heap == StormHeap::guarded ? "guarded" : "plain"; }

}  // namespace

bool RunStorm(const StormPlan& plan) {
    static Sequence sequence;
    if (!MakeSequence(plan, sequence)) return false;
    progress = {plan.control.c_str(), plan.seed, NameOf(plan.heap), &sequence, 0};
    WatchForCrashes();
    if (plan.heap == StormHeap::guarded) GuardLibraryHeap();
    if (HasOwnImports()) FollowHandles();
    ReplaceWaiting();
    CountImportCalls();

    Stage stage;
    ReplacePrinter(stage);
    // What the process keeps for ever is made in the first steps.
    const size_t warm = std::min(kWarmUp, sequence.size() / 2);
    RunSteps(stage, sequence, 0, warm);
    stage.clear();
    const Balance before = TakeBalance(stage);
    RunSteps(stage, sequence, warm, sequence.size());
    stage.clear();
    CompareBalance(stage, before);
    std::printf("%s: seed %llu, %s heap, %u steps, %d pictures compared, %d pages, %d sheets\n",
                plan.control.c_str(), static_cast<unsigned long long>(plan.seed), NameOf(plan.heap),
                static_cast<unsigned>(sequence.size()), ChartsCompared() + OtherPicturesCompared(),
                PagesPrinted(), SheetsUsed());
    std::fflush(stdout);
    return true;
}

bool RecordStorm(const StormPlan& plan, const std::string& path) {
    Sequence sequence;
    std::ofstream file(path, std::ios::binary);
    if (!MakeSequence(plan, sequence) || !file) return false;
    for (const Operation& operation : sequence) Write(file, operation);
    return file.good();
}

}  // namespace kortest
