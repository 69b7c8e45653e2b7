#include "KeptData.h"

#include "TextFolding.h"

#include <QHash>

#include <algorithm>
#include <utility>

namespace kareport
{

namespace
{

/// What is kept of older dictionaries and orders, so that a change that is taken back shows at once.
constexpr std::size_t mostLists = 8;

/// Variables that know nothing of the template that they come from: lists of rows outlive it.
struct KnownVariables
{
    struct Kind
    {
        int type;
        unsigned id;
    };

    explicit KnownVariables(const Variables &variables) : names(variables.names)
    {
        for (const QString &name : names) {
            if (const auto parser = variables.find(name)) {
                kinds.insert(foldedKey(name), {parser->type(), parser->id()});
            }
        }
    }

    Variables in(const DataUnits &units) const
    {
        Variables found;
        found.names = names;
        found.find = [all = kinds, units](const QString &name) -> std::optional<ValueParser> {
            const auto kind = all.constFind(foldedKey(name));
            return kind != all.constEnd() ? std::optional(ValueParser(kind->type, kind->id, units)) : std::nullopt;
        };
        return found;
    }

    QStringList names;
    QHash<QString, Kind> kinds; ///< by the folded names
};

/// The same for requests that the same rows answer. No name has a line feed.
QString keyOf(const QString &data, const DataRequest &request, const std::vector<unsigned> &ids)
{
    const Variables variables = request.variables();
    QString key = data + (request.firstOnly ? QStringLiteral("\nfirst\n") : QStringLiteral("\nall\n"));
    for (const QString &name : variables.names) {
        if (const auto parser = variables.find(name)) {
            key += name + QStringLiteral(" %1 %2\n").arg(parser->type()).arg(parser->id());
        }
    }
    for (const unsigned id : ids) {
        key += QStringLiteral("by %1\n").arg(id);
    }
    return key;
}

} // namespace

/// An open list of rows, with those that were read so far.
struct KeptData::Kept
{
    QString key;
    std::unique_ptr<RowList> list;
    std::shared_ptr<DataUnits> units; ///< those that its variables were asked for in
    std::deque<UDataObject> rows;     ///< the first ones
    bool isAtEnd = false;             ///< the list has been read to its end at least once
    bool isBroken = false;            ///< it was stopped, and has no more rows for that reason
};

/// The rows of a data set for one step of one run.
class KeptData::Rows : public RowList
{
public:
    Rows(KeptData &data, QString name, const DataSource &set, DataRequest request, std::shared_ptr<Kept> kept)
        : data_(data), name_(std::move(name)), set_(set), request_(std::move(request)), kept_(std::move(kept))
    {}

    UDataObject *GetAt(std::size_t index) override
    {
        if (data_.isFull_()) {
            return nullptr;
        }
        if (request_.firstOnly && kept_->isAtEnd && index > 0) {
            isAtEnd_ = true; // the others have been looked at before
            return nullptr;
        }
        while (index >= kept_->rows.size() && kept_->rows.size() < mostRows && readNext()) {
        }
        const UDataObject *found = index < kept_->rows.size() ? &kept_->rows[index] : nullptr;
        if (found == nullptr && kept_->rows.size() == mostRows) {
            found = fromList(index);
        }
        if (found == nullptr) {
            isAtEnd_ = true;
            return nullptr;
        }
        row_ = *found; // who asks may change it
        return &row_;
    }

    void Sort(const std::vector<unsigned> &ids) override
    {
        auto sorted = data_.keptRows(name_, set_, request_, ids);
        if (const InputError *error = errorOf(sorted)) {
            error_ = *error;
            return;
        }
        kept_ = std::get<std::shared_ptr<Kept>>(std::move(sorted));
        isAtEnd_ = false;
    }

    std::optional<InputError> error() const override
    {
        if (error_) {
            return error_;
        }
        // Rows that were not asked for may be wrong, but they have not been checked.
        return isAtEnd_ || kept_->rows.empty() ? kept_->list->error() : std::nullopt;
    }
    std::optional<SourceColumns> columns() const override { return kept_->list->columns(); }
    std::vector<InputError> notes() const override
    {
        return isAtEnd_ ? kept_->list->notes() : std::vector<InputError>();
    }

private:
    const UDataObject *fromList(std::size_t index)
    {
        const UDataObject *object = kept_->list->GetAt(index);
        if (object == nullptr) {
            (data_.isStoppedNow_() ? kept_->isBroken : kept_->isAtEnd) = true;
        }
        return object;
    }
    bool readNext()
    {
        const UDataObject *object = kept_->isAtEnd || kept_->isBroken ? nullptr : fromList(kept_->rows.size());
        if (object != nullptr) {
            kept_->rows.push_back(*object);
        }
        return object != nullptr;
    }

    KeptData &data_;
    QString name_;
    const DataSource &set_;
    DataRequest request_;
    std::shared_ptr<Kept> kept_;
    std::optional<InputError> error_;
    UDataObject row_;
    bool isAtEnd_ = false; ///< this step has come to the end
};

/// Takes the place of a data set.
class KeptData::Source : public DataSource
{
public:
    Source(KeptData &data, QString name, std::shared_ptr<const DataSource> set)
        : data_(data), name_(std::move(name)), set_(std::move(set))
    {}

    Expected<std::unique_ptr<RowList>> open(const DataRequest &request) const override
    {
        const KnownVariables known(request.variables());
        const auto variables = [known](const DataUnits &units) { return known.in(units); };
        DataRequest own = {data_.source_,       request.path, variables,       request.units,   request.firstOnly,
                           data_.job_.settings, data_.files_, data_.progress_, data_.isStopped_};
        auto kept = data_.keptRows(name_, *set_, own, {});
        if (const InputError *error = errorOf(kept)) {
            return *error;
        }
        auto &found = std::get<std::shared_ptr<Kept>>(kept);
        request.variablesIn(*found->units); // who asks notes the units, also of a list that has been open for long
        std::unique_ptr<RowList> rows = std::make_unique<Rows>(data_, name_, *set_, std::move(own), std::move(found));
        return rows;
    }

    QStringList files() const override { return set_->files(); }
    QStringList possibleFiles() const override { return set_->possibleFiles(); }
    bool isAllInFiles() const override { return set_->isAllInFiles(); }
    bool hasOwnUnits() const override { return set_->hasOwnUnits(); }
    bool readsStandardInput() const override { return set_->readsStandardInput(); }
    std::optional<InputError> noRow() const override { return set_->noRow(); }

private:
    KeptData &data_;
    QString name_;
    std::shared_ptr<const DataSource> set_;
};

KeptData::KeptData(JsonSource source, Job job)
    : source_(std::move(source)),
      job_(std::move(job)),
      progress_(false),
      isFull_([] { return false; }),
      isStoppedNow_(isFull_),
      isStopped_([this] { return isStoppedNow_(); })
{}

KeptData::~KeptData() = default;

Job KeptData::job()
{
    Job job = job_;
    for (auto set = job.data.begin(); set != job.data.end(); ++set) {
        set->source = std::make_shared<Source>(*this, set.key(), set->source);
    }
    return job;
}

void KeptData::begin(std::function<bool()> isFull, std::function<bool()> isStopped)
{
    isFull_ = std::move(isFull);
    isStoppedNow_ = std::move(isStopped);
}

void KeptData::end()
{
    std::erase_if(kept_, [](const std::shared_ptr<Kept> &kept) { return kept->isBroken; });
    // What reads ahead between runs is not to be stopped by what has ended.
    begin([] { return false; }, [] { return false; });
}

/// The rows of a data set in an order, opened where they are not kept. @param ids  of the sort keys; none for the source's order
Expected<std::shared_ptr<KeptData::Kept>> KeptData::keptRows(const QString &name, const DataSource &set,
                                                             const DataRequest &request,
                                                             const std::vector<unsigned> &ids)
{
    const QString key = keyOf(name, request, ids);
    const auto found = std::find_if(kept_.begin(), kept_.end(),
                                    [&key](const std::shared_ptr<Kept> &kept) { return kept->key == key; });
    if (found != kept_.end() && !(*found)->isBroken) {
        kept_.splice(kept_.begin(), kept_, found);
        return kept_.front();
    }
    ++openings_;
    auto units = std::make_shared<DataUnits>(request.units);
    DataRequest noted = request;
    noted.variablesIn = [units, in = request.variablesIn](const DataUnits &asked) {
        *units = asked;
        return in(asked);
    };
    auto opened = set.open(noted);
    if (const InputError *error = errorOf(opened)) {
        return *error;
    }
    auto kept = std::make_shared<Kept>();
    kept->key = key;
    kept->units = std::move(units);
    kept->list = std::get<std::unique_ptr<RowList>>(std::move(opened));
    if (!ids.empty()) {
        kept->list->Sort(ids);
        kept->isBroken = isStoppedNow_();
    }
    kept_.push_front(kept);
    if (kept_.size() > mostLists) {
        kept_.pop_back();
    }
    return kept;
}

} // namespace kareport
