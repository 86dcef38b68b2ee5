// The time range that all plots and bands share, and the moment under the pointer.
const axis = {
    first: report.first,
    last: Math.max(report.last, report.first + 1000),
    from: 0,
    to: 0,
    moment: null, // under the pointer, else null
    onRange: [],
    onMoment: [],

    show(from, to) {
        const shortest = 1000;
        const length = Math.min(Math.max(to - from, shortest), this.last - this.first);
        this.from = Math.min(Math.max((from + to - length) / 2, this.first), this.last - length);
        this.to = this.from + length;
        this._soon('onRange');
    },
    showAll() { this.show(this.first, this.last); },
    // Keeps `center` where it is.
    zoom(factor, center = (this.from + this.to) / 2) {
        this.show(center - (center - this.from) * factor, center + (this.to - center) * factor);
    },
    pan(milliseconds) {
        const step = Math.min(Math.max(milliseconds, this.first - this.from), this.last - this.to);
        this.show(this.from + step, this.to + step);
    },
    point(moment) {
        this.moment = moment;
        this._soon('onMoment');
    },
    // What the readings at the side are for.
    readingTime() { return this.moment ?? this.to; },

    // Once for each frame, however fast events come.
    _soon(listeners) {
        this._pending ??= new Set();
        if (this._pending.size === 0) {
            requestAnimationFrame(() => {
                const pending = this._pending;
                this._pending = null;
                for (const listener of [...pending].flatMap((name) => this[name]))
                    listener();
            });
        }
        this._pending.add(listeners);
        if (listeners === 'onRange')
            this._pending.add('onMoment');
    },
};
axis.from = axis.first;
axis.to = axis.last;

// Draws a line at the moment across `surface`, and lets it be dragged, panned and pinched. `area()` gives the
// left edge and the width, in pixels, of the part that shows the time axis.
function makeInteractive(surface, area) {
    const line = surface.appendChild(element('div', {className: 'cursor', hidden: true}));
    const selection = surface.appendChild(element('div', {className: 'selection', hidden: true}));
    const fingers = new Map();
    let drag = null;

    const timeAt = (event) => {
        const {left, width} = area();
        const part = (event.clientX - surface.getBoundingClientRect().left - left) / width;
        return axis.from + Math.min(Math.max(part, 0), 1) * (axis.to - axis.from);
    };
    const positionOf = (time) => area().left + (time - axis.from) / (axis.to - axis.from) * area().width;

    axis.onMoment.push(() => {
        line.hidden = axis.moment === null || axis.moment < axis.from || axis.moment > axis.to;
        if (!line.hidden)
            line.style.left = `${positionOf(axis.moment)}px`;
    });

    const spread = () => {
        const [a, b] = [...fingers.values()];
        return Math.max(Math.abs(a - b), 10);
    };
    surface.addEventListener('pointerdown', (event) => {
        if (event.button !== 0)
            return;
        fingers.set(event.pointerId, event.clientX);
        if (fingers.size === 2) {
            drag = {pinch: spread()};
        } else if (event.pointerType === 'mouse') {
            drag = {start: timeAt(event), x: event.clientX, isPan: event.shiftKey};
            surface.setPointerCapture(event.pointerId);
        }
        axis.point(timeAt(event));
    });
    surface.addEventListener('pointermove', (event) => {
        if (fingers.has(event.pointerId))
            fingers.set(event.pointerId, event.clientX);
        if (drag?.pinch && fingers.size === 2) {
            axis.zoom(drag.pinch / spread(), timeAt(event));
            drag.pinch = spread();
        } else if (drag?.isPan) {
            axis.pan((drag.x - event.clientX) / area().width * (axis.to - axis.from));
            drag.x = event.clientX;
        } else if (drag) {
            const [left, right] = [positionOf(drag.start), positionOf(timeAt(event))].sort((a, b) => a - b);
            Object.assign(selection.style, {left: `${left}px`, width: `${right - left}px`});
            selection.hidden = right - left < 4;
        }
        axis.point(timeAt(event));
    });
    const end = (event) => {
        fingers.delete(event.pointerId);
        if (event.type === 'pointerup' && drag && !selection.hidden)
            axis.show(...[drag.start, timeAt(event)].sort((a, b) => a - b));
        selection.hidden = true;
        drag = null;
    };
    surface.addEventListener('pointerup', end);
    surface.addEventListener('pointercancel', end);
    surface.addEventListener('pointerleave', (event) => {
        if (event.pointerType === 'mouse' && !drag)
            axis.point(null);
    });
    surface.addEventListener('dblclick', () => axis.showAll());
}
