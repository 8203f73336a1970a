/// The parts of the index page that are the same for all documents.
#pragma once

namespace DrawmereConvert {

/// Tells the program that a file is its own.
constexpr const char* indexMark = "<meta name=\"generator\" content=\"drawmere-convert\">";

constexpr const char* indexStyle = R"(
:root { --z: 1; --back: #eee; --text: #222; --mark: #ddd; --desk: #777; }
body { display: grid; grid: auto minmax(0, 1fr) / auto minmax(0, 1fr); height: 100vh; margin: 0;
    font: 15px/1.4 sans-serif; }
header { grid-column: 1 / 3; display: flex; flex-wrap: wrap; gap: .3rem; align-items: center;
    padding: .3rem .6rem; background: #222; color: #eee; }
header button { min-width: 2.2rem; height: 1.9rem; font: inherit; color: inherit;
    white-space: nowrap; background: #444; border: 0; border-radius: 4px; cursor: pointer; }
header button:hover { background: #666; }
:focus-visible { outline: 2px solid #4af; outline-offset: -2px; }
main:focus-visible { outline: 0; }
header input { width: 4em; font: inherit; text-align: right; }
header .space { flex: 1; }
nav { grid-column: 1; width: 18rem; overflow: auto; padding: .4rem .8rem 1rem 0;
    background: var(--back); color: var(--text); }
nav ul { margin: 0; padding-left: 1rem; list-style: none; }
nav a, nav span { display: block; padding: .1rem .2rem; color: inherit;
    text-decoration: none; overflow-wrap: anywhere; }
nav a:hover { background: var(--mark); }
body:not(.outline) nav { display: none; }
main { grid-column: 2; overflow: auto; padding: 1rem; background: var(--desk); }
section { position: relative; margin: 0 auto 1rem; overflow: hidden; background: #fff;
    width: calc(var(--w) * 1pt * var(--z)); height: calc(var(--h) * 1pt * var(--z)); }
iframe { width: calc(var(--w) * 1pt); height: calc(var(--h) * 1pt); border: 0;
    transform: scale(var(--z)); transform-origin: 0 0; pointer-events: none; }
section a, section i { position: absolute; }
section a:hover, section a:focus-visible { background: #04f2; }
@media (prefers-color-scheme: dark) {
    :root { color-scheme: dark; --back: #282828; --text: #ddd; --mark: #444; --desk: #111; }
    iframe { color-scheme: light; }
}
@media (max-width: 40rem) {
    main { grid-column: 1 / 3; padding: .4rem; }
    nav { position: absolute; z-index: 1; top: var(--top); bottom: 0; max-width: 85%;
        box-shadow: 0 0 1rem #0008; box-sizing: border-box; }
    #smaller, #larger, #print, .space { display: none; }
}
@media print {
    header, body nav { display: none; }
    body { display: block; height: auto; }
    main { overflow: visible; padding: 0; }
    section { margin: 0; break-after: page; break-inside: avoid; }
    section:last-of-type { break-after: auto; }
}
)";

constexpr const char* indexScript = R"(
{
    const pages = [...document.querySelectorAll('section')];
    const find = name => document.getElementById(name);
    const field = find('number');
    const main = document.querySelector('main');
    let zoom = 1;

    function topOf(page) {
        return page.getBoundingClientRect().top - main.getBoundingClientRect().top;
    }

    function current() {
        const line = main.clientHeight / 3;
        let low = 0, high = pages.length - 1;
        while (low < high) {
            const middle = (low + high + 1) >> 1;
            if (topOf(pages[middle]) <= line) { low = middle; } else { high = middle - 1; }
        }
        return low;
    }

    function show(number) {
        const page = pages[Math.max(0, Math.min(pages.length - 1, Math.trunc(number) || 0))];
        page.scrollIntoView();
        field.value = pages.indexOf(page) + 1;
    }

    function setZoom(value) {
        const page = pages[current()];
        const place = topOf(page) / page.offsetHeight;
        zoom = Math.max(.1, Math.min(10, value));
        document.documentElement.style.setProperty('--z', zoom);
        find('zoom').textContent = Math.round(100 * zoom) + ' %';
        main.scrollBy(0, topOf(page) - place * page.offsetHeight);
    }

    function widest() { return Math.max(...pages.map(page => page.offsetWidth)) / zoom; }

    function room() {
        const style = getComputedStyle(main);
        return main.clientWidth - parseFloat(style.paddingLeft) - parseFloat(style.paddingRight);
    }

    function fit() { setZoom((room() - 1) / widest()); }

    const narrow = matchMedia('(max-width: 40rem)');
    const outline = find('outline');

    function open(isOpen) {
        document.body.classList.toggle('outline', isOpen);
        outline.setAttribute('aria-expanded', isOpen);
    }

    function toggle() {
        if (outline) { open(!document.body.classList.contains('outline')); }
    }

    const actions = {
        previous: () => show(current() - 1), next: () => show(current() + 1),
        smaller: () => setZoom(zoom / 1.2), zoom: () => setZoom(1), larger: () => setZoom(zoom * 1.2),
        fit: fit, outline: toggle, print: printAll,
    };
    const keys = {
        ArrowLeft: 'previous', k: 'previous', p: 'previous', ArrowRight: 'next', j: 'next', n: 'next',
        '-': 'smaller', '0': 'zoom', '+': 'larger', '=': 'larger', w: 'fit', o: 'outline',
    };

    for (const button of document.querySelectorAll('button')) {
        button.addEventListener('click', event => {
            actions[button.id]();
            if (event.detail) { main.focus({preventScroll: true}); } // the keys that scroll go there
        });
    }
    for (const entry of document.querySelectorAll('nav a')) {
        entry.addEventListener('click', () => { if (narrow.matches) { open(false); } });
    }
    field.addEventListener('change', () => show(field.value - 1));
    addEventListener('keydown', event => {
        if (event.key === 'p' && (event.ctrlKey || event.metaKey)) {
            event.preventDefault();
            printAll();
            return;
        }
        const name = keys[event.key];
        if (name && event.target !== field && !event.ctrlKey && !event.metaKey && !event.altKey) {
            event.preventDefault();
            actions[name]();
        }
    });
    main.addEventListener('scroll', () => {
        if (document.activeElement !== field) { field.value = current() + 1; }
    }, {passive: true});

    addEventListener('resize', () => {
        const header = document.querySelector('header');
        document.documentElement.style.setProperty('--top', header.offsetHeight + 'px');
    });

    // A page is read when it comes near and dropped when it is far away again.
    function place(section, isNear) {
        const frame = section.querySelector('iframe');
        if (!isNear && frame) { frame.remove(); }
        if (!isNear || frame) { return; }
        const fresh = document.createElement('iframe');
        fresh.src = section.dataset.file;
        fresh.title = 'Page ' + section.id.slice(1);
        fresh.tabIndex = -1;
        fresh.scrolling = 'no';
        const loaded = new Promise(done => fresh.addEventListener('load', done));
        section.prepend(fresh);
        return loaded;
    }

    // A browser prints what is there, and does not wait for pages that are read then.
    function printAll() {
        observer.disconnect();
        Promise.all(pages.map(page => place(page, true))).then(() => window.print());
    }

    const observer = new IntersectionObserver(
        entries => entries.forEach(entry => place(entry.target, entry.isIntersecting)),
        {root: main, rootMargin: '150% 0px'});
    pages.forEach(page => observer.observe(page));
    addEventListener('beforeprint', () => {
        document.documentElement.style.setProperty('--z', 1);
    });
    addEventListener('afterprint', () => {
        document.documentElement.style.setProperty('--z', zoom);
        pages.forEach(page => observer.observe(page));
    });

    dispatchEvent(new Event('resize'));
    if (outline && narrow.matches) { open(false); }
    if (widest() > room()) { fit(); }
    main.focus();
}
)";

} // namespace DrawmereConvert
