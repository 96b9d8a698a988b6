namespace mirel {
}
