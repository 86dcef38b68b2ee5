'use strict';

// Names and values come from the network and from SIM cards. They enter the page as text, never as markup.
function element(name, properties, ...children) {
    const node = Object.assign(document.createElement(name), properties);
    node.append(...children);
    return node;
}

const byId = (id) => document.getElementById(id);
const report = JSON.parse(byId('data').textContent);

// Positions on the time axis are milliseconds that never decrease. Where the capture's clock goes back, a shift
// joins them: what was captured is the position less the last shift at or before it.
function capturedTime(position) {
    let shift = 0;
    for (const [from, milliseconds] of report.shifts) {
        if (from > position)
            break;
        shift = milliseconds;
    }
    return position - shift;
}

// "2026-01-05 08:01:53.900"
const dateAndTime = (position) => new Date(capturedTime(position)).toISOString().replace('T', ' ').replace('Z', '');
// "08:01:53.9"
const timeOfDay = (position) => dateAndTime(position).slice(11, 21);

const kMonths = ['Jan', 'Feb', 'Mar', 'Apr', 'May', 'Jun', 'Jul', 'Aug', 'Sep', 'Oct', 'Nov', 'Dec'];
function dayOf(position) {
    const date = new Date(capturedTime(position));
    return `${date.getUTCDate()} ${kMonths[date.getUTCMonth()]} ${date.getUTCFullYear()}`;
}

// "1 h 02 min", "2 min 00 s", "12.4 s"
function durationText(milliseconds) {
    if (milliseconds < 59950)
        return `${Number((milliseconds / 1000).toFixed(1))} s`;
    const seconds = Math.round(milliseconds / 1000);
    const two = (number) => String(number).padStart(2, '0');
    if (seconds < 3600)
        return `${Math.floor(seconds / 60)} min ${two(seconds % 60)} s`;
    return `${Math.floor(seconds / 3600)} h ${two(Math.floor(seconds / 60) % 60)} min`;
}

const grouped = (number) => number.toLocaleString('en-US');
const percentText = (share) => `${(100 * share).toFixed(1)} %`;

// How many decimals tell these numbers apart, two at most.
function decimalsOf(numbers) {
    let decimals = 0;
    for (const number of numbers) {
        if (number !== null && !Number.isInteger(number))
            decimals = Math.max(decimals, Number.isInteger(number * 10) ? 1 : 2);
        if (decimals === 2)
            break;
    }
    return decimals;
}

const numberText = (number, decimals) => number.toFixed(decimals).replace('-', '−');

// What identifies cells and channels, as short as there is room for beside a plot and on a phone.
const kShortNames = [['Physical Cell ID', 'PCI'], ['E-ARFCN', 'EARFCN'], ['Scrambling Code', 'PSC'],
    ['Transport Channel ID', 'TrCH'], ['TRCH ID', 'TrCH'], ['CCTRCH ID', 'CCTrCH']];
const shortName = (text) => kShortNames.reduce((result, [name, short]) => result.replaceAll(name, short), text);
