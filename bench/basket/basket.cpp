// The steps that a customer feels on the page of pictures, with 5,000 pictures found and as many in the basket. Each
// should stay under 1 ms; adding a folder is one step for all its files.
#include "selection/Basket.h"
#include "order/EditRecord.h"
#include "selection/FolderPager.h"

#include <benchmark/benchmark.h>

using namespace Qt::StringLiterals;

namespace {

using namespace lumora;

constexpr int pictures = 5000;
const DrivePath folder(u"E:\\DCIM\\100CAMERA\\חופשה בצפון"_s);

QStringList names() {
    QStringList list;
    for (int i = 0; i < pictures; ++i)
        list += u"IMG_%1.jpg"_s.arg(i, 5, 10, QLatin1Char('0'));
    return list;
}

FolderPager foundPictures() {
    FolderPager pager;
    pager.addFolder(folder, names());
    return pager;
}

QString line(int copies, const QString& path, LineForm form) {
    return BasketLine{PrintCode{copies, u"1015"_s, u'G', u"NB"_s}.compose(), EditRecord::newPicture(), DrivePath(path)}
        .compose(form);
}

Basket fullBasket(LineForm form) {
    Basket basket;
    basket.setForm(form);
    const FolderPager found = foundPictures();
    for (const QString& path : found.paths().items())
        basket.append(line(1, path, form));
    return basket;
}

LineForm formOf(const benchmark::State& state) {
    return state.range(0) == 0 ? LineForm::Short : LineForm::Full;
}

void AddFolder(benchmark::State& state) {
    const QStringList files = names();
    for (auto _ : state) {
        FolderPager pager;
        benchmark::DoNotOptimize(pager.addFolder(folder, files));
    }
}

// A page: its twelve paths, and for each the look into the basket.
void TurnPage(benchmark::State& state) {
    FolderPager pager = foundPictures();
    const Basket basket = fullBasket(formOf(state));
    for (auto _ : state) {
        if (pager.currentIndex() >= pictures - 1) {
            state.PauseTiming();
            pager = foundPictures();
            state.ResumeTiming();
        }
        for (const QString& path : pager.FillPageList())
            benchmark::DoNotOptimize(basket.FindByPath(path));
    }
}

void PlusOnTheLastPicture(benchmark::State& state) {
    Basket basket = fullBasket(formOf(state));
    const QString path = foundPictures().item(pictures - 1);
    int copies = 1;
    for (auto _ : state) {
        const int index = basket.FindByPath(path);
        copies = copies % PrintCode::mostCopies + 1;
        basket.replaceAt(index, BasketLine::withCopies(basket.item(index), copies));
        benchmark::DoNotOptimize(basket.SumCopies());
    }
}

// Removing a line moves all lines behind it.
void MinusAndChoiceOfTheFirstPicture(benchmark::State& state) {
    Basket basket = fullBasket(formOf(state));
    for (auto _ : state) {
        const QString first = BasketLine::split(basket.item(0), basket.form()).path.text();
        basket.removeAt(basket.FindByPath(first));
        if (basket.FindByPath(first) < 0)
            basket.append(line(1, first, basket.form()));
        benchmark::DoNotOptimize(basket.SumCopies());
    }
}

void WholeFolder(benchmark::State& state) {
    const FolderPager pager = foundPictures();
    for (auto _ : state) {
        Basket basket;
        for (const QString& path : pager.paths().items()) {
            if (basket.FindByPath(path) < 0)
                basket.append(line(1, path, LineForm::Short));
        }
        benchmark::DoNotOptimize(basket.SumCopies());
    }
}

} // namespace

BENCHMARK(AddFolder)->Unit(benchmark::kMicrosecond);
BENCHMARK(TurnPage)->Arg(0)->Arg(1)->Unit(benchmark::kMicrosecond);
BENCHMARK(PlusOnTheLastPicture)->Arg(0)->Arg(1)->Unit(benchmark::kMicrosecond);
BENCHMARK(MinusAndChoiceOfTheFirstPicture)->Arg(0)->Arg(1)->Unit(benchmark::kMicrosecond);
BENCHMARK(WholeFolder)->Unit(benchmark::kMicrosecond);
BENCHMARK_MAIN();
