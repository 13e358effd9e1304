// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/boundary/CheckedLayout.h>

#include <exception>
#include <limits>
#include <new>
#include <stdexcept>
#include <utility>
#include <vector>

namespace olvane {

namespace {

// Travels from the data source through the engine, and never leaves this file.
struct SourceFailure {
    CheckedOutcome outcome;
};

bool isPersonId(std::int64_t id) {
    return id >= 1 && id <= std::numeric_limits<std::int32_t>::max();
}

std::string wrongIdText(std::int64_t id) {
    return std::to_string(id) + " is no id: ids are 1 to 2147483647";
}

// Passes questions on, and names the question in what it throws.
class CheckedSource final : public OlvaneViewerManagerWrapProtocol {
public:
    explicit CheckedSource(std::shared_ptr<OlvaneViewerManagerWrapProtocol> source)
        : source_(std::move(source)) {}

    std::int64_t fatherForPersonWithID(std::int64_t person) override {
        return parent({HostOperation::father, person},
                      [&] { return source_->fatherForPersonWithID(person); });
    }
    std::int64_t motherForPersonWithID(std::int64_t person) override {
        return parent({HostOperation::mother, person},
                      [&] { return source_->motherForPersonWithID(person); });
    }
    std::vector<std::int64_t> spousesForPersonWithID(std::int64_t person) override {
        return list({HostOperation::spouses, person},
                    [&] { return source_->spousesForPersonWithID(person); });
    }
    std::vector<std::int64_t> childrenForPersonWithID(std::int64_t person) override {
        return list({HostOperation::children, person},
                    [&] { return source_->childrenForPersonWithID(person); });
    }
    bool isPreferredSpouse(std::int64_t person, std::int64_t spouse) override {
        return ask({HostOperation::isPreferredSpouse, person},
                   [&] { return source_->isPreferredSpouse(person, spouse); });
    }
    bool isPersonDead(std::int64_t person) override {
        return ask({HostOperation::isPersonDead, person}, [&] { return source_->isPersonDead(person); });
    }
    std::string dateForPersonWithID(std::int64_t person, bool isBirth) override {
        return ask({HostOperation::date, person},
                   [&] { return source_->dateForPersonWithID(person, isBirth); });
    }
    std::int32_t sexOfPersonWithID(std::int64_t person) override {
        return ask({HostOperation::sex, person}, [&] { return source_->sexOfPersonWithID(person); });
    }

private:
    struct Question {
        HostOperation operation;
        std::int64_t person;
    };

    [[noreturn]] static void fail(CheckedStatus status, const Question& question, std::string cause) {
        throw SourceFailure{{status, {question.operation, question.person, std::move(cause)}}};
    }

    // The failure is thrown behind the handlers: an exception of another language must have ended by then.
    template <class Call>
    static auto ask(const Question& question, const Call& call) -> decltype(call()) {
        CheckedStatus status = CheckedStatus::hostFailed;
        std::string cause;
        try {
            return call();
        } catch (const std::bad_alloc&) {
            status = CheckedStatus::outOfMemory;
        } catch (const std::exception& error) {
            cause = error.what();
        } catch (...) {
        }
        if (status == CheckedStatus::outOfMemory) fail(status, question, std::string());
        fail(status, question, cause.empty() ? "an exception without a text" : std::move(cause));
    }

    static void checkId(const Question& question, std::int64_t id) {
        if (!isPersonId(id))
            fail(CheckedStatus::invalidId, question,
                 "answered " + std::to_string(id) + ", which is no id: ids are 1 to 2147483647");
    }

    template <class Call>
    static std::int64_t parent(const Question& question, const Call& call) {
        const std::int64_t id = ask(question, call);
        if (id != kPersonNotFound) checkId(question, id);
        return id;
    }

    template <class Call>
    static std::vector<std::int64_t> list(const Question& question, const Call& call) {
        std::vector<std::int64_t> ids = ask(question, call);
        for (const std::int64_t id : ids) checkId(question, id);
        return ids;
    }

    std::shared_ptr<OlvaneViewerManagerWrapProtocol> source_;
};

// The checked calls of this thread: there is one at most.
class RunningCall {
public:
    RunningCall() : isFirst_(!isRunning_) { isRunning_ = true; }
    ~RunningCall() {
        if (isFirst_) isRunning_ = false;
    }
    RunningCall(const RunningCall&) = delete;
    RunningCall& operator=(const RunningCall&) = delete;

    bool isFirst() const { return isFirst_; }

private:
    static thread_local bool isRunning_;
    bool isFirst_;
};

thread_local bool RunningCall::isRunning_ = false;

CheckedOutcome outcome(CheckedStatus status, std::string cause) {
    return {status, {HostOperation::none, 0, std::move(cause)}};
}

CheckedOutcome outcomeOf(const std::shared_ptr<OlvaneViewerManagerWrapProtocol>& source,
                         const CheckedWork& work) {
    try {
        work(std::make_shared<CheckedSource>(source));
    } catch (const SourceFailure& failure) {
        return failure.outcome;
    } catch (const std::bad_alloc&) {
        return outcome(CheckedStatus::outOfMemory, std::string());
    } catch (const std::invalid_argument& error) {
        return outcome(CheckedStatus::invalidArgument, error.what());
    } catch (const std::exception& error) {
        return outcome(CheckedStatus::layoutFailed, error.what());
    } catch (...) {
        return outcome(CheckedStatus::layoutFailed, "an exception without a text");
    }
    return {};
}

}  // namespace

const char* nameOf(HostOperation operation) {
    switch (operation) {
        case HostOperation::none:
            break;
        case HostOperation::father:
            return "fatherForPersonWithID";
        case HostOperation::mother:
            return "motherForPersonWithID";
        case HostOperation::spouses:
            return "spousesForPersonWithID";
        case HostOperation::children:
            return "childrenForPersonWithID";
        case HostOperation::isPreferredSpouse:
            return "isPreferredSpouse";
        case HostOperation::isPersonDead:
            return "isPersonDead";
        case HostOperation::date:
            return "dateForPersonWithID";
        case HostOperation::sex:
            return "sexOfPersonWithID";
    }
    return "";
}

std::string FailureReason::text() const {
    if (operation == HostOperation::none) return cause;
    return std::string(nameOf(operation)) + "(" + std::to_string(person) + "): " + cause;
}

CheckedOutcome checkedRun(const std::shared_ptr<OlvaneViewerManagerWrapProtocol>& source,
                          std::int64_t focusId, const CheckedWork& work) noexcept {
    try {
        const RunningCall running;
        if (!running.isFirst()) {
            return outcome(CheckedStatus::nestedCall,
                           "an operation of the data source asked for a layout while one is running");
        }
        if (!source) return outcome(CheckedStatus::invalidArgument, "no data source");
        if (!isPersonId(focusId)) {
            return {CheckedStatus::invalidPerson, {HostOperation::none, focusId, wrongIdText(focusId)}};
        }
        return outcomeOf(source, work);
    } catch (...) {
        return {CheckedStatus::outOfMemory, {}};  // the reason itself found no memory
    }
}

CheckedLayout checkedLayout(TypedLayout::View view, std::int64_t focusId,
                            const std::shared_ptr<OlvaneViewerManagerWrapProtocol>& source,
                            const LayoutOptions& options) noexcept {
    CheckedLayout result;
    // One reference is captured, so the closure needs no memory of its own.
    struct Request {
        TypedLayout::View view;
        std::int64_t focusId;
        const LayoutOptions& options;
        TypedLayout& layout;
    } const request{view, focusId, options, result.layout};
    static_cast<CheckedOutcome&>(result) = checkedRun(
        source, focusId, [&request](const std::shared_ptr<OlvaneViewerManagerWrapProtocol>& checked) {
            layOut(request.view, request.focusId, checked, request.options, request.layout);
        });
    return result;
}

}  // namespace olvane
