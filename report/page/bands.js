// Strips above the plots: which cell served, and what state the connection was in.

// The index of the last of `times` (ascending) at or before the moment; -1 when there is none.
function lastAtOrBefore(times, moment) {
    let low = 0;
    let high = times.length;
    while (low < high) {
        const middle = (low + high) >> 1;
        if (times[middle] <= moment)
            low = middle + 1;
        else
            high = middle;
    }
    return low - 1;
}

function textAt(band, moment) {
    const index = lastAtOrBefore(band.times, moment);
    return index < 0 ? null : band.texts[index];
}

// A colour for each text in the order of appearance, another one than the neighbour's.
function colorIndexes(band) {
    const count = kThemes.light.bands.length;
    const indexes = new Map();
    let before = -1;
    for (const text of band.texts) {
        if (text === null)
            continue;
        if (!indexes.has(text)) {
            const next = indexes.size % count;
            indexes.set(text, next === before ? (next + 1) % count : next);
        }
        before = indexes.get(text);
    }
    return indexes;
}

function drawBand(canvas, band, indexes) {
    const {width, height} = canvas.getBoundingClientRect();
    if (width === 0)
        return;
    const scale = window.devicePixelRatio || 1;
    canvas.width = Math.round(width * scale);
    canvas.height = Math.round(height * scale);
    const context = canvas.getContext('2d');
    context.scale(scale, scale);
    context.font = `12px ${getComputedStyle(document.body).fontFamily}`;
    context.textBaseline = 'middle';
    const x = (time) => (time - axis.from) / (axis.to - axis.from) * width;
    const colors = theme.colors();
    for (let i = Math.max(lastAtOrBefore(band.times, axis.from), 0); i < band.times.length; ++i) {
        const left = Math.max(x(band.times[i]), 0);
        const right = Math.min(x(band.times[i + 1] ?? axis.last), width);
        if (left >= width)
            break;
        if (band.texts[i] === null || right <= 0)
            continue;
        context.fillStyle = colors.bands[indexes.get(band.texts[i])];
        context.fillRect(left, 0, Math.max(right - left - 1, 0.5), height);
        const gap = report.gaps.find(([from, to]) => x(to) > left && x(from) < right);
        writeLabel(context, band.texts[i], left, gap ? x(gap[0]) : right, height);
    }
    context.fillStyle = colors.gap;
    for (const [from, to] of report.gaps)
        context.fillRect(x(from), 0, x(to) - x(from), height);
}

// The label, or as much of its beginning as fits; nothing where that would not be understood.
function writeLabel(context, text, left, right, height) {
    const room = right - left - 10;
    if (room < 24)
        return;
    let shown = text;
    while (shown.length > 3 && context.measureText(shown).width > room)
        shown = `${shown.slice(0, shown.endsWith('…') ? -2 : -1)}…`;
    if (context.measureText(shown).width > room)
        return;
    context.fillStyle = theme.colors().text;
    context.fillText(shown, left + 5, height / 2 + 0.5);
}

function addBand(band) {
    const canvas = element('canvas', {className: 'strip'});
    const surface = element('div', {className: 'surface strip-surface'}, canvas);
    const reading = element('div', {className: 'band-reading'});
    const remark = band.bucket > 0 ? `Thinned: one text for each ${durationText(band.bucket)}.` : '';
    byId('bands').append(element('div', {className: 'track band'}, element('h3', {textContent: band.title}), surface,
        reading, element('p', {className: 'remark', textContent: remark})));
    const indexes = colorIndexes(band);
    const draw = () => drawBand(canvas, band, indexes);
    const read = () => { reading.textContent = textAt(band, axis.readingTime()) ?? '—'; };
    axis.onRange.push(draw);
    axis.onMoment.push(read);
    theme.onChange.push(draw);
    new ResizeObserver(draw).observe(canvas);
    makeInteractive(surface, () => ({left: canvas.offsetLeft, width: canvas.clientWidth}));
}
