// The frame page of the web help: contents, index and search beside the topic. Works from a server and from
// the disk, where a page can't look into its frame: topics and the search page say by message what they are.
(function () {
  "use strict";
  const byId = id => document.getElementById(id);
  const body = document.body, frame = byId("right"), contents = byId("contents");
  const start = document.currentScript.dataset.start;
  const helpTitle = document.title;
  const SEARCH_PAGE = "ss.html";
  const narrow = matchMedia("(max-width: 700px)");

  // ---- Pages. A page is its address behind the folder of this one, as the browser writes it.
  const folder = location.href.replace(/[?#].*$/, "").replace(/[^/]*$/, "");
  const pageOf = href => href.startsWith(folder) ? href.slice(folder.length) : null;
  function plain(page) {
    try { return decodeURIComponent(page); } catch (e) { return page; }
  }
  let shown = "";

  function show(page) { frame.contentWindow.location.href = folder + page; }

  /// A topic opened by itself comes here with its own address, in quotes, behind the question mark. Only a
  /// page of this folder is shown: any other address is passed over.
  function askedPage() {
    const asked = (location.search + location.hash).slice(1).replace(/^("|%22)|("|%22)$/g, "");
    const page = asked.startsWith(folder) ? asked.slice(folder.length) : asked;
    return /^[^/\\:?#]+\.html?$/i.test(plain(page.replace(/#.*/, ""))) && !/^main\.htm/i.test(page) ? page : "";
  }

  function noteShown(href, title) {
    const page = pageOf(href);
    if (page === null || page === shown && !search.awaited) return;
    shown = page;
    frame.title = title || "Topic";
    document.title = title && title !== helpTitle ? title + " \u2013 " + helpTitle : helpTitle;
    const isSearch = page.startsWith(SEARCH_PAGE);
    search.arrived(isSearch);
    if (isSearch) return;
    tree.select(page);
    // The address of this page leads back to the topic, also after a reload or from a bookmark.
    try { history.replaceState(null, "", "?" + page); } catch (e) { /* not from the disk */ }
  }

  addEventListener("message", event => {
    const message = event.data;
    if (!message) return;
    // The search page says this as it leaves; by then its window may be gone and the message without a source.
    if (message.tovimar === "found" && (event.source === null || event.source === frame.contentWindow)) search.found = message.words;
    if (event.source !== frame.contentWindow) return;
    if (message.tovimar === "page") noteShown(String(message.href), String(message.title));
    if (message.tovimar === "key" && message.key === "/") search.focus();
    if (message.tovimar === "key" && message.key === "Escape") panel.closeOverlay();
  });
  // On a server pages without the topics' script are followed too.
  frame.addEventListener("load", () => {
    try {
      const inside = frame.contentWindow.location.href;
      if (inside !== "about:blank") noteShown(inside, frame.contentDocument.title);
    } catch (e) { /* from the disk the page has said it itself */ }
  });

  // ---- Contents. The page holds the whole tree as plain lists; a list gets its roles and openers when it
  // is opened first, so that thousands of topics cost nothing before they are seen.
  const tree = {
    top: contents.querySelector("ul"), current: null, stop: null, links: null, typed: "", typedAt: 0, ids: 0,

    /// The list of an entry stands behind it.
    listOf(entry) {
      const list = entry.nextElementSibling;
      return list && list.tagName === "UL" ? list : null;
    },
    linkOf: entry => entry.querySelector("a"),
    entryOfList(list) {
      const entry = list.previousElementSibling;
      return entry && entry.tagName === "LI" ? entry : null;
    },
    parentOf(entry) { return entry.parentElement === this.top ? null : this.entryOfList(entry.parentElement); },

    prepare(list, level) {
      if (list.dataset.level) return;
      list.dataset.level = level;
      for (const entry of [...list.children]) {
        if (entry.tagName !== "LI") continue;
        const link = this.linkOf(entry), below = this.listOf(entry);
        entry.setAttribute("role", "none");
        link.setAttribute("role", "treeitem");
        link.setAttribute("aria-level", level);
        link.tabIndex = -1;
        if (!below) continue;
        entry.classList.add("branch");
        below.id = "list" + ++this.ids;
        below.setAttribute("role", "group");
        link.setAttribute("aria-owns", below.id);
        link.setAttribute("aria-expanded", "false");
        const twist = document.createElement("span");
        twist.className = "twist";
        entry.prepend(twist);
      }
    },
    isOpen(entry) { return entry.classList.contains("opened"); },
    setOpen(entry, open) {
      const list = this.listOf(entry);
      if (!list) return;
      if (open) this.prepare(list, Number(entry.parentElement.dataset.level) + 1);
      list.classList.toggle("open", open);
      entry.classList.toggle("opened", open);
      this.linkOf(entry).setAttribute("aria-expanded", String(open));
    },

    linkTo(page) {
      if (!this.links) {
        this.links = new Map();
        for (const link of contents.getElementsByTagName("a")) {
          const target = plain(link.getAttribute("href"));
          if (!this.links.has(target)) this.links.set(target, link);
        }
      }
      return this.links.get(plain(page)) || this.links.get(plain(page.replace(/#.*/, "")));
    },
    select(page) {
      const link = this.linkTo(page);
      // An entry that was clicked is marked already; what has been closed since stays closed.
      if (link && link !== this.current) this.mark(link);
      else if (!link && this.current) {
        this.current.removeAttribute("aria-current");
        this.current = null;
      }
    },
    mark(link) {
      if (this.current) this.current.removeAttribute("aria-current");
      this.current = link;
      link.setAttribute("aria-current", "page");
      const above = [];
      for (let entry = this.parentOf(link.parentElement); entry; entry = this.parentOf(entry)) above.unshift(entry);
      above.forEach(entry => this.setOpen(entry, true));
      this.setStop(link);
      link.scrollIntoView({ block: "nearest" });
    },
    /// One entry is reached by the tabulator, the others from there by arrows.
    setStop(link) {
      if (this.stop) this.stop.tabIndex = -1;
      this.stop = link;
      link.tabIndex = 0;
    },
    focus(entry) {
      if (!entry) return;
      this.setStop(this.linkOf(entry));
      this.stop.focus();
    },

    sibling(entry, step) {
      let next = entry[step];
      while (next && next.tagName !== "LI") next = next[step];
      return next;
    },
    firstIn(list) { return list.querySelector(":scope > li"); },
    lastIn(list) {
      const entry = [...list.children].filter(e => e.tagName === "LI").pop();
      return entry && this.isOpen(entry) ? this.lastIn(this.listOf(entry)) : entry;
    },
    next(entry) {
      if (this.isOpen(entry)) return this.firstIn(this.listOf(entry));
      for (; entry; entry = this.parentOf(entry)) {
        const next = this.sibling(entry, "nextElementSibling");
        if (next) return next;
      }
      return null;
    },
    previous(entry) {
      const before = this.sibling(entry, "previousElementSibling");
      if (!before) return this.parentOf(entry);
      return this.isOpen(before) ? this.lastIn(this.listOf(before)) : before;
    },
    /// The next visible entry that begins with what has been typed quickly.
    typeAhead(entry, key, time) {
      this.typed = time - this.typedAt < 700 ? this.typed + key : key;
      this.typedAt = time;
      const wanted = fold(this.typed);
      let next = this.typed.length > 1 ? entry : this.next(entry) || this.firstIn(this.top);
      for (let steps = 0; next && steps < 20000; steps++) {
        if (fold(next.textContent.trim()).startsWith(wanted)) return next;
        next = this.next(next) || this.firstIn(this.top);
        if (next === entry) return null;
      }
      return null;
    },
    key(event) {
      const link = event.target.closest("a");
      if (!link || event.ctrlKey || event.altKey || event.metaKey) return;
      const entry = link.parentElement, list = this.listOf(entry);
      const moves = {
        ArrowDown: () => this.focus(this.next(entry)),
        ArrowUp: () => this.focus(this.previous(entry)),
        ArrowRight: () => !list ? 0 : this.isOpen(entry) ? this.focus(this.firstIn(list)) : this.setOpen(entry, true),
        ArrowLeft: () => this.isOpen(entry) ? this.setOpen(entry, false) : this.focus(this.parentOf(entry)),
        Home: () => this.focus(this.firstIn(this.top)),
        End: () => this.focus(this.lastIn(this.top)),
        " ": () => link.click(),
        "*": () => [...entry.parentElement.children].forEach(e => e.tagName === "LI" && this.setOpen(e, true))
      };
      if (moves[event.key]) moves[event.key]();
      else if (event.key.length === 1 && event.key !== "/") this.focus(this.typeAhead(entry, event.key, event.timeStamp));
      else return;
      event.preventDefault();
    },
    click(event) {
      if (event.target.classList.contains("twist")) {
        const entry = event.target.parentElement;
        this.setOpen(entry, !this.isOpen(entry));
        return;
      }
      const link = event.target.closest("a");
      if (!link) return;
      this.mark(link);
      this.setOpen(link.parentElement, true);
      panel.closeOverlay();
    },
    begin() {
      if (!this.top) return;
      this.top.setAttribute("role", "tree");
      this.top.setAttribute("aria-label", byId("tabContents").textContent);
      this.prepare(this.top, 1);
      const first = this.firstIn(this.top);
      if (first) this.setStop(this.linkOf(first));
      contents.addEventListener("click", event => this.click(event));
      contents.addEventListener("keydown", event => this.key(event));
    }
  };

  const LETTERS = { "ß": "ss", "æ": "ae", "œ": "oe", "ø": "o", "ł": "l", "đ": "d", "ı": "i" };
  function fold(text) {
    return text.normalize("NFKD").toLowerCase().replace(/[\u0300-\u036f]/g, "").replace(/[ßæœøłđı]/g, c => LETTERS[c]);
  }

  // ---- Index. Only the rows in sight are elements: the list of a big application has tens of thousands.
  const index = {
    ROW: 28, all: null, rows: [], active: -1, box: byId("words"), field: byId("filter"), room: byId("words").firstElementChild,

    read() {
      this.all = [...byId("options").content.querySelectorAll("option")].map(option => {
        const text = option.textContent;
        return { text: text, folded: fold(text), page: option.getAttribute("value") };
      });
    },
    filter() {
      if (!this.all) this.read();
      const wanted = fold(this.field.value.trim());
      this.rows = wanted ? this.all.filter(row => row.folded.includes(wanted)) : this.all;
      this.room.style.height = this.rows.length * this.ROW + "px";
      const none = byId("noWords");
      none.textContent = this.rows.length ? "" : none.dataset.none;
      this.box.scrollTop = 0;
      this.activate(wanted && this.rows.length ? 0 : -1);
    },
    draw() {
      const first = Math.max(0, Math.floor(this.box.scrollTop / this.ROW) - 8);
      const end = Math.min(this.rows.length, first + Math.ceil(this.box.clientHeight / this.ROW) + 16);
      const drawn = document.createDocumentFragment();
      for (let i = first; i < end; i++) drawn.append(this.option(i));
      this.room.replaceChildren(drawn);
    },
    option(i) {
      const row = this.rows[i], option = document.createElement("div"), wanted = fold(this.field.value.trim());
      option.id = "word" + i;
      option.dataset.row = i;
      option.style.top = i * this.ROW + "px";
      for (const [name, value] of [["role", "option"], ["aria-setsize", this.rows.length], ["aria-posinset", i + 1], ["aria-selected", i === this.active]])
        option.setAttribute(name, value);
      // Folding may change the length of a text; then nothing is marked.
      const at = wanted && row.folded.length === row.text.length ? row.folded.indexOf(wanted) : -1;
      if (at < 0) option.textContent = row.text;
      else {
        const mark = document.createElement("mark");
        mark.textContent = row.text.substr(at, wanted.length);
        option.append(row.text.slice(0, at), mark, row.text.slice(at + wanted.length));
      }
      return option;
    },
    activate(i) {
      this.active = i;
      const top = i * this.ROW, view = this.box.clientHeight;
      if (i >= 0 && top < this.box.scrollTop) this.box.scrollTop = top;
      if (i >= 0 && top + this.ROW > this.box.scrollTop + view) this.box.scrollTop = top + this.ROW - view;
      this.draw();
      if (i >= 0) this.field.setAttribute("aria-activedescendant", "word" + i);
      else this.field.removeAttribute("aria-activedescendant");
    },
    open(i) {
      if (!this.rows[i]) return;
      this.activate(i);
      show(this.rows[i].page);
      panel.closeOverlay();
    },
    key(event) {
      const page = Math.max(1, Math.floor(this.box.clientHeight / this.ROW) - 1);
      const steps = { ArrowDown: 1, ArrowUp: -1, PageDown: page, PageUp: -page };
      if (steps[event.key]) this.activate(Math.max(0, Math.min(this.rows.length - 1, this.active + steps[event.key])));
      else if (event.key === "Enter") this.open(Math.max(0, this.active));
      else return;
      event.preventDefault();
    },
    begin() {
      this.field.addEventListener("input", () => this.filter());
      this.field.addEventListener("keydown", event => this.key(event));
      this.box.addEventListener("scroll", () => this.draw());
      this.box.addEventListener("click", event => {
        const option = event.target.closest("[role=option]");
        if (option) this.open(Number(option.dataset.row));
      });
    }
  };

  // ---- Search. The search page shows its results in the topic's place, and is told each keystroke.
  const search = {
    // Awaited is the page from the asking to its arrival, whatever topic still comes in between.
    field: byId("query"), state: "", awaited: false, before: "", found: null, focusResults: false,

    type() {
      const text = this.field.value;
      if (this.state === "shown") this.send();
      else if (this.state === "" && text.trim()) {
        this.state = "loading";
        this.awaited = true;
        this.before = shown;
        show(SEARCH_PAGE + "#q=" + encodeURIComponent(text));
        panel.closeOverlay();
      }
    },
    send() { frame.contentWindow.postMessage({ tovimar: "search", text: this.field.value }, "*"); },
    /// A page has come into the frame.
    arrived(isSearch) {
      if (!isSearch) {
        this.state = "";
        if (this.found) frame.contentWindow.postMessage({ tovimar: "mark", words: this.found }, "*");
        this.found = null;
        return;
      }
      if (this.awaited) this.send();
      else if (this.state !== "shown") {
        const asked = /#q=(.*)/.exec(shown);
        this.field.value = asked ? plain(asked[1]) : "";
      }
      this.awaited = false;
      this.state = "shown";
      if (this.focusResults) this.toResults();
    },
    toResults() {
      this.type();
      this.focusResults = this.state === "loading";
      if (this.state !== "shown") return;
      frame.focus();
      frame.contentWindow.postMessage({ tovimar: "focus" }, "*");
    },
    leave() {
      this.field.value = "";
      if (this.state) show(this.before || start);
      this.state = "";
      this.awaited = false;
    },
    focus() {
      focus();
      this.field.focus();
      this.field.select();
    },
    key(event) {
      if (event.key === "ArrowDown") this.toResults();
      else if (event.key === "Escape") this.leave();
      else return;
      event.preventDefault();
    },
    begin() {
      this.field.addEventListener("input", () => this.type());
      this.field.addEventListener("keydown", event => this.key(event));
      byId("search").addEventListener("submit", event => { event.preventDefault(); this.toResults(); });
    }
  };

  // ---- The panel with its tabs, its width and its way over the topic on narrow screens.
  const panel = {
    tabs: [byId("tabContents"), byId("tabIndex")],

    choose(tab) {
      for (const each of this.tabs) {
        const chosen = each === tab;
        each.setAttribute("aria-selected", String(chosen));
        each.tabIndex = chosen ? 0 : -1;
        byId(each.getAttribute("aria-controls")).hidden = !chosen;
      }
      if (tab.id === "tabIndex") index.filter();
    },
    setClosed(closed) {
      body.classList.toggle("closed", closed);
      byId("toggle").setAttribute("aria-expanded", String(!closed));
      if (!closed && tree.current) tree.current.scrollIntoView({ block: "nearest" });
    },
    closeOverlay() { if (narrow.matches) this.setClosed(true); },
    setWidth(width) {
      const kept = Math.round(Math.max(190, Math.min(width, innerWidth * 0.7)));
      body.style.setProperty("--width", kept + "px");
      byId("bar").setAttribute("aria-valuenow", kept);
      try { localStorage.setItem("webhelp.width", kept); } catch (e) { /* not kept */ }
    },
    tabKey(event) {
      if (event.key !== "ArrowLeft" && event.key !== "ArrowRight") return;
      const other = this.tabs[1 - this.tabs.indexOf(event.target)];
      this.choose(other);
      other.focus();
    },
    beginBar() {
      const bar = byId("bar"), left = byId("left");
      let kept = 0;
      try { kept = Number(localStorage.getItem("webhelp.width")); } catch (e) { /* not kept */ }
      if (kept) this.setWidth(kept);
      bar.addEventListener("pointerdown", event => {
        bar.setPointerCapture(event.pointerId);
        body.classList.add("dragging");
      });
      bar.addEventListener("pointermove", event => {
        if (body.classList.contains("dragging")) this.setWidth(event.clientX + 3);
      });
      bar.addEventListener("lostpointercapture", () => body.classList.remove("dragging"));
      bar.addEventListener("keydown", event => {
        const step = { ArrowLeft: -16, ArrowRight: 16 }[event.key];
        if (step) this.setWidth(left.offsetWidth + step);
      });
    },
    begin() {
      for (const tab of this.tabs) {
        tab.addEventListener("click", () => this.choose(tab));
        tab.addEventListener("keydown", event => this.tabKey(event));
      }
      byId("toggle").addEventListener("click", () => this.setClosed(!body.classList.contains("closed")));
      document.querySelector("main").addEventListener("click", event => {
        if (event.target.tagName === "MAIN") this.closeOverlay();
      });
      narrow.addEventListener("change", () => this.setClosed(narrow.matches));
      this.setClosed(narrow.matches);
      this.beginBar();
    }
  };

  addEventListener("keydown", event => {
    const typing = /^(INPUT|TEXTAREA|SELECT)$/.test(event.target.tagName);
    if (event.key === "/" && !typing || event.ctrlKey && event.key.toLowerCase() === "k") {
      search.focus();
      event.preventDefault();
    }
    if (event.key === "Escape" && narrow.matches && !body.classList.contains("closed")) {
      panel.setClosed(true);
      byId("toggle").focus();
    }
  });

  tree.begin();
  index.begin();
  search.begin();
  panel.begin();
  const first = askedPage() || start;
  if (first) frame.contentWindow.location.replace(folder + first);
})();
