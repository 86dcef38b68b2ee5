// The plots: each value holds until the next one, or until its row is gone.
const kMostLines = 8; // shown from the start
const kAxisWidth = 52;

// Its legend writes style attributes, which the page's policy refuses; the readings at the side replace it.
Dygraph.PLUGINS = [Dygraph.Plugins.Axes, Dygraph.Plugins.Grid];

// Rows of dygraphs: [time, value of each line]. Nothing is drawn where no message came for long.
function plotRows(lines) {
    const moments = new Set([axis.first, axis.last]);
    lines.forEach((line) => line.times.forEach((time) => moments.add(time)));
    report.gaps.forEach((gap) => gap.forEach((time) => moments.add(time)));
    const times = Float64Array.from(moments).sort();
    const next = lines.map(() => 0);
    let gap = 0;
    return Array.from(times, (time) => {
        while (gap < report.gaps.length && report.gaps[gap][1] <= time)
            ++gap;
        const isInGap = gap < report.gaps.length && report.gaps[gap][0] <= time;
        const row = [time];
        lines.forEach((line, i) => {
            while (next[i] < line.times.length && line.times[next[i]] <= time)
                ++next[i];
            row.push(isInGap || next[i] === 0 ? null : line.numbers[next[i] - 1]);
        });
        return row;
    });
}

function tickText(position) {
    const time = Number(position);
    const text = dateAndTime(time);
    if (text.slice(11) === '00:00:00.000')
        return dayOf(time).slice(0, -5);
    const range = axis.to - axis.from;
    if (range < 15000)
        return text.slice(14, 21);
    return range < 900000 ? text.slice(11, 19) : text.slice(11, 16);
}

function drawBackground(context, area, graph) {
    const colors = theme.colors();
    context.fillStyle = colors.gap;
    for (const [from, to] of report.gaps) {
        const left = graph.toDomXCoord(from);
        context.fillRect(left, area.y, graph.toDomXCoord(to) - left, area.h);
    }
    const serving = report.bands.find((band) => band.isCell);
    const changes = serving ? serving.times.filter((time) => time > axis.from && time < axis.to) : [];
    if (changes.length > area.w / 8)
        return;
    context.strokeStyle = colors.change;
    context.setLineDash([1, 3]);
    for (const time of changes) {
        const x = Math.round(graph.toDomXCoord(time)) + 0.5;
        context.beginPath();
        context.moveTo(x, area.y);
        context.lineTo(x, area.y + area.h);
        context.stroke();
    }
    context.setLineDash([]);
}

function makeGraph(host, plot) {
    const lines = plot.lines.filter((line) => line.isShown);
    const colors = theme.colors();
    const labels = ['time', ...lines.map((line, i) => `line ${i}`)];
    const series = Object.fromEntries(lines.map((line, i) =>
        [`line ${i}`, {color: lineColor(line.index), strokePattern: kDashes[dashOf(line.index)]}]));
    return new Dygraph(host, plotRows(lines), {
        labels, series, legend: 'never', interactionModel: {}, stepPlot: true, strokeWidth: 1.6,
        highlightCircleSize: 0, dateWindow: [axis.from, axis.to], includeZero: plot.fromZero, yRangePad: 8,
        gridLineColor: colors.grid, axisLineColor: colors.axis, axisLabelFontSize: 12, rightGap: 8,
        underlayCallback: drawBackground, labelsUTC: true,
        axes: {
            x: {ticker: Dygraph.dateTicker, axisLabelFormatter: tickText, drawGrid: false, pixelsPerLabel: 80},
            y: {axisLabelWidth: kAxisWidth - 6, pixelsPerLabel: 24,
                axisLabelFormatter: (number) => String(Number(number.toFixed(2))).replace('-', '−')},
        },
    });
}

// One line of the list at the side: shows and hides its line, and reads its value.
function addReading(list, plot, line, redraw) {
    const swatch = element('span', {className: 'swatch'});
    const value = element('span', {className: 'value'});
    const button = element('button', {type: 'button', className: 'reading', title: line.title},
        swatch, element('span', {className: 'label', textContent: line.label}), value);
    const update = () => {
        button.setAttribute('aria-pressed', String(line.isShown));
        swatch.style.borderTopStyle = kBorders[dashOf(line.index)];
        swatch.style.borderTopColor = lineColor(line.index);
    };
    button.addEventListener('click', () => {
        line.isShown = !line.isShown;
        update();
        redraw();
    });
    axis.onMoment.push(() => {
        const index = lastAtOrBefore(line.times, axis.readingTime());
        const number = index < 0 ? null : line.numbers[index];
        value.textContent = number === null ? '—' : numberText(number, plot.decimals);
    });
    theme.onChange.push(update);
    list.append(button);
}

function remarksOf(plot) {
    const remarks = [];
    const thinned = plot.lines.filter((line) => line.bucket);
    if (thinned.length > 0) {
        const longest = Math.max(...thinned.map((line) => line.bucket));
        remarks.push(`Thinned: of every ${durationText(longest)} or less, ${thinned.length === plot.lines.length
            ? '' : `${thinned.length} lines show `}the highest, the lowest and the last value.`);
    }
    if (plot.lines.length > kMostLines)
        remarks.push(`The ${kMostLines} shown longest are drawn; the others can be added.`);
    if (plot.omitted > 0)
        remarks.push(`${grouped(plot.omitted)} with lower peaks are left out.`);
    return remarks.join(' ');
}

function prepareLines(plot) {
    plot.lines.forEach((line) => {
        let time = 0;
        line.times = line.steps.map((step) => time += step);
        const name = line.path.split('/').at(-1);
        line.name = name === '*' ? '' : name;
    });
    const isOneName = plot.lines.every((line) => line.key && line.name === plot.lines[0].name);
    plot.lines.forEach((line) => {
        line.title = isOneName ? line.key : [line.key, line.name].filter(Boolean).join(' · ');
        line.label = shortName(line.title);
        line.duration = line.times.reduce((sum, time, i) =>
            line.numbers[i] === null ? sum : sum + (line.times[i + 1] ?? axis.last) - time, 0);
    });
    if (plot.lines.length > kMostLines)
        plot.lines.sort((a, b) => b.duration - a.duration);
    plot.lines.forEach((line, index) => Object.assign(line, {index, isShown: index < kMostLines}));
    plot.decimals = Math.max(...plot.lines.map((line) => decimalsOf(line.numbers)));
}

// Returns a function that builds the plot at once; else that happens when it comes into view.
function addPlot(plot) {
    prepareLines(plot);
    const host = element('div', {className: 'graph'});
    const surface = element('div', {className: 'surface'}, host);
    const readings = element('div', {className: 'readings'});
    const track = element('div', {className: 'track plot'},
        element('h3', {}, plot.title, element('span', {className: 'unit', textContent: plot.unit})), surface, readings,
        element('p', {className: 'remark', textContent: remarksOf(plot)}));
    byId('plots').append(track);

    let graph = null;
    const draw = () => {
        graph?.destroy();
        graph = makeGraph(host, plot);
    };
    const build = () => graph ?? draw();
    plot.lines.forEach((line) => addReading(readings, plot, line, draw));
    axis.onRange.push(() => graph?.updateOptions({dateWindow: [axis.from, axis.to]}));
    theme.onChange.push(() => graph && draw());
    makeInteractive(surface, () => {
        const area = graph?.getArea() ?? {x: kAxisWidth, w: host.clientWidth - kAxisWidth};
        return {left: host.offsetLeft + area.x, width: area.w};
    });
    new IntersectionObserver((entries) => entries.some((entry) => entry.isIntersecting) && build(),
        {rootMargin: '400px'}).observe(host);
    new ResizeObserver(() => graph?.resize()).observe(host);
    return build;
}
