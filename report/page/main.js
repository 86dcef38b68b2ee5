// Puts the report together.

function addHeader() {
    const isOneDay = dayOf(report.first) === dayOf(report.last);
    document.title = `${report.name} – Orvex report`;
    byId('name').textContent = report.name;
    byId('span').textContent = `${report.technologyName} · ${dayOf(report.first)}, ${dateAndTime(report.first).slice(11, 19)} – `
        + `${isOneDay ? '' : `${dayOf(report.last)}, `}${dateAndTime(report.last).slice(11, 19)} UTC`;
    const facts = [
        ['Technology', report.technology],
        ['From (UTC)', dateAndTime(report.first)],
        ['To (UTC)', dateAndTime(report.last)],
        ['Duration', durationText(report.last - report.first)],
        ['Messages', `${grouped(report.messages)} (${grouped(report.bytes)} bytes)`],
        ['Sampled', `every ${durationText(report.every)}, ${grouped(report.samples)} samples`],
    ];
    byId('facts').append(...facts.map(([name, value]) =>
        element('div', {}, element('dt', {textContent: name}), element('dd', {textContent: value}))));
    byId('notes').hidden = report.notes.length === 0;
    byId('notes').append(...report.notes.map((note) => element('li', {textContent: note})));
    byId('made').textContent = `Made by orvex-decode ${report.version}. Times are the capture’s own, in UTC. This page holds `
        + 'everything it shows and loads nothing.';
}

function addContents() {
    byId('contents').append(...[...document.querySelectorAll('main section')].map((section) =>
        element('a', {href: `#${section.id}`, textContent: section.querySelector('h2').textContent})));
}

function addControls() {
    const step = () => (axis.to - axis.from) / 4;
    const actions = {
        earlier: () => axis.pan(-step()), later: () => axis.pan(step()), 'zoom-in': () => axis.zoom(0.5),
        'zoom-out': () => axis.zoom(2), reset: () => axis.showAll(), theme: () => theme.toggle(),
    };
    for (const [id, action] of Object.entries(actions))
        byId(id).addEventListener('click', action);
    axis.onMoment.push(() => { byId('moment').textContent = `${timeOfDay(axis.readingTime())} UTC`; });
    axis.onRange.push(() => { byId('reset').disabled = axis.from <= axis.first && axis.to >= axis.last; });
    matchMedia('(prefers-color-scheme: dark)').addEventListener('change', () => theme.apply());
}

addHeader();
addControls();
report.bands.forEach(addBand);
const plotBuilders = report.plots.map(addPlot);
byId('over-time').hidden = report.bands.length + report.plots.length === 0;
addServingCells();
addNeighbours();
addContexts();
addSim();
addGaps();
addCodes();
addTree();
addContents();
theme.apply();
axis.showAll();

// Paper is white and narrow, and shows plots that nobody scrolled to.
window.addEventListener('beforeprint', () => {
    document.documentElement.classList.add('printing');
    theme.isPrinting = true;
    plotBuilders.forEach((build) => build());
    theme.apply();
});
window.addEventListener('afterprint', () => {
    document.documentElement.classList.remove('printing');
    theme.isPrinting = false;
    theme.apply();
});
