#include "telephonyd/modem/DiagnosticPort.h"

#include "platform/base/Bytes.h"

#include <algorithm>
#include <cstdio>
#include <utility>

namespace orvane
{

namespace
{

// A group's place has 12 bits; a modem that claims more codes has no way to name them.
constexpr std::uint32_t kMostCodesInGroup = 4096;

std::string refusedCodes(std::uint32_t group)
{
    char text[40];
    std::snprintf(text, sizeof text, "the log codes 0x%X000 to 0x%XFFF", group & 0xFU,
                  group & 0xFU);
    return text;
}

} // namespace

DiagnosticPort::DiagnosticPort(MainQueue& queue, std::unique_ptr<ByteDevice> device, Events events)
    : _queue(queue), _device(std::move(device)), _events(std::move(events))
{
    _device->setCallbacks([this](ByteView bytes) { received(bytes); },
                          [this](const std::string& reason) { fail(reason); });
    proceed();
}

void DiagnosticPort::setWantedCodes(LogCodes codes)
{
    if (_finish || codes == _wanted)
        return;
    _wanted = std::move(codes);
    _isSettled = false;
    proceed();
}

void DiagnosticPort::finish(std::function<void()> done)
{
    _finish = std::move(done);
    _wanted.clear();
    if (_phase == Phase::Ended)
        finished();
    else
        proceed();
}

DiagnosticPort::Counts DiagnosticPort::counts() const
{
    Counts counts = _totals;
    counts.damagedFrames = _reader.droppedFrames();
    return counts;
}

void DiagnosticPort::received(ByteView bytes)
{
    _reader.append(bytes);
    while (const auto payload = _reader.next())
        take(*payload);
}

void DiagnosticPort::take(ByteView payload)
{
    const DiagnosticItem item = diagnosticItemIn(payload);
    if (item.isItem) {
        if (item.bytes.empty()) {
            ++_totals.damagedItems;
            return;
        }
        ++_totals.items;
        if (_phase == Phase::Serving)
            _events.item(item.bytes);
        return;
    }
    if (!_pending)
        return;
    const auto found = _pending->request.answerIn(payload);
    if (!found)
        return;
    if (found->kind == DiagnosticAnswer::Kind::NotNow)
        _pending->wasPutOff = true; // repeated when the time is over
    else
        answer(*found);
}

void DiagnosticPort::fail(const std::string& reason)
{
    if (std::exchange(_phase, Phase::Ended) == Phase::Ended)
        return;
    _pending.reset();
    ++_sent;
    if (_finish) {
        finished();
        return;
    }
    const auto failed = std::move(_events.failed); // it may destroy the port
    failed(reason);
}

void DiagnosticPort::proceed()
{
    if (_pending)
        return;
    switch (_phase) {
    case Phase::Greeting:
        return greet();
    case Phase::SwitchingOff:
        return switchOff(Phase::AskingRanges);
    case Phase::AskingRanges:
        return askRanges();
    case Phase::Serving:
        return proceedServing();
    case Phase::Ended:
        return;
    }
}

void DiagnosticPort::proceedServing()
{
    if (_wanted.empty() && _mayBeOn)
        switchOff(Phase::Serving);
    else if (_finish)
        finished();
    else if (!setNextMask() && !std::exchange(_isSettled, true))
        _events.settled();
}

void DiagnosticPort::greet()
{
    // Even a refusal is a proof of life.
    ask(DiagnosticRequest::version(),
        [this](const DiagnosticAnswer&) { _phase = Phase::SwitchingOff; });
}

void DiagnosticPort::switchOff(Phase next)
{
    ask(DiagnosticRequest::allOff(), [this, next](const DiagnosticAnswer& answer) {
        if (answer.kind != DiagnosticAnswer::Kind::Done)
            _events.refused("to switch all log codes off");
        _mayBeOn = false;
        _asked.clear();
        _phase = next;
    });
}

void DiagnosticPort::askRanges()
{
    if (_finish)
        return finished();
    ask(DiagnosticRequest::ranges(), [this](const DiagnosticAnswer& answer) {
        if (answer.kind == DiagnosticAnswer::Kind::Done)
            _ranges = answer.ranges;
        _phase = Phase::Serving;
        _events.ready();
    });
}

// False when all groups are as they should be.
bool DiagnosticPort::setNextMask()
{
    const Groups groups = groupsOfWantedCodes();
    for (const auto& [group, places] : groups) {
        const auto asked = _asked.find(group);
        if (asked == _asked.end() || asked->second != places) {
            setMask(group, places);
            return true;
        }
    }
    for (const auto& [group, places] : _asked)
        if (!places.empty() && !groups.contains(group)) {
            setMask(group, {});
            return true;
        }
    return false;
}

void DiagnosticPort::setMask(std::uint32_t group, const std::set<std::uint32_t>& places)
{
    const std::uint32_t count = codesInGroup(group, places);
    // Before the answer: a mask whose answer is lost is set all the same.
    _mayBeOn = true;
    _asked[group] = places;
    ask(DiagnosticRequest::setMask(group, count, places),
        [this, group, count](const DiagnosticAnswer& answer) {
            if (answer.kind == DiagnosticAnswer::Kind::Done)
                _acceptedCounts[group] = count;
            else
                _events.refused(refusedCodes(group));
        });
}

DiagnosticPort::Groups DiagnosticPort::groupsOfWantedCodes()
{
    Groups groups;
    std::vector<std::uint16_t> missing;
    for (const std::uint16_t code : _wanted) {
        const std::uint32_t group = logGroupOf(code);
        const std::uint32_t place = logPlaceOf(code);
        if (_ranges && place >= (*_ranges)[group])
            missing.push_back(code);
        else
            groups[group].insert(place);
    }
    if (!missing.empty())
        _events.missing(missing);
    return groups;
}

std::uint32_t DiagnosticPort::codesInGroup(std::uint32_t group,
                                           const std::set<std::uint32_t>& places) const
{
    if (_ranges)
        return std::min((*_ranges)[group], kMostCodesInGroup);
    // A shorter mask than before might leave the codes beyond it on.
    const auto accepted = _acceptedCounts.find(group);
    const std::uint32_t before = accepted == _acceptedCounts.end() ? 1 : accepted->second;
    return places.empty() ? before : std::max(before, *places.rbegin() + 1);
}

void DiagnosticPort::ask(DiagnosticRequest request, Answered answered)
{
    _pending = Pending{std::move(request), std::move(answered)};
    send();
}

void DiagnosticPort::send()
{
    ++_pending->tries;
    _frame.clear();
    appendDiagnosticFrame(_frame, _pending->request.payload());
    _device->write(_frame);
    _queue.after(kAnswerTime, _lifetime.whileAlive([this, sent = ++_sent] {
        if (sent == _sent)
            timeIsOver();
    }));
}

void DiagnosticPort::timeIsOver()
{
    if (!_pending)
        return;
    if (_pending->tries < kTries)
        send();
    else if (_pending->wasPutOff)
        answer({DiagnosticAnswer::Kind::NotNow, {}});
    else
        fail("it does not answer");
}

void DiagnosticPort::answer(const DiagnosticAnswer& answer)
{
    const Answered answered = std::move(_pending->answered);
    _pending.reset();
    answered(answer);
    proceed();
}

void DiagnosticPort::finished()
{
    _phase = Phase::Ended;
    _queue.async(_lifetime.whileAlive([done = std::exchange(_finish, [] {})] { done(); }));
}

} // namespace orvane
